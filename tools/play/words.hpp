// SPDX-License-Identifier: MIT
// Puts into words what a control or a window shows, for the transcript.
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "qz/drivers/driver.hpp"
#include "qz/styled_text/attributed_string.hpp"
#include "tools/walkthrough/step_picture.hpp"

namespace qz::tools::play {

using namespace walkthrough;

/// Returns "on", "off" or "mixed".
std::string_view stateWord(toolkit::State state);

/// Returns the name of a standard colour; "#rrggbb" for any other, with its opacity if below 1.
std::string colorWords(const toolkit::Color& color);

/// Returns the attributes of a run, such as "Times 12 bold, red, centred"; "plain" if it has none.
std::string styleWords(const toolkit::TextAttributes& attributes);

/// Says when something happens that is `seconds` ahead: "in 2.5 s", or "practically never" from a
/// year on.
std::string whenWords(double seconds);

/// Returns a number in at most six significant digits, such as "12" or "12.5".
std::string numberWords(double number);

/// Returns what the control says to its user: the title of a button, the text of anything else.
const toolkit::AttributedString& captionOf(const ControlPicture& control);

/// Returns the caption without its attributes, or the name of an image view's image.
std::string contentOf(const ControlPicture& control);

/// Returns what else is worth knowing about the control, such as "hidden" or "tooltip “…”".
std::vector<std::string> remarksOn(const ControlPicture& control);

/// The same about a window: its size, whether it is on the screen, its background.
std::vector<std::string> remarksOn(const drivers::WindowPicture& window);

}  // namespace qz::tools::play
