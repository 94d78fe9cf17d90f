// SPDX-License-Identifier: MIT
// How the transcript puts into words what a control or a window shows.
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "toolkit/styled_text/attributed_string.hpp"
#include "toolkit/test_driver.hpp"
#include "tools/play/step_picture.hpp"

namespace tools::play {

/// A person's word for a kind of view, such as "check box".
std::string_view kindWord(toolkit::ViewKind kind);

/// Whether views of the kind are buttons: what a user presses, and what has a title.
bool isButton(toolkit::ViewKind kind);

/// "on", "off" or "mixed".
std::string_view stateWord(toolkit::State state);

/// A standard colour by its name, any other as "#rrggbb", with its opacity where it has one.
std::string colorWords(const toolkit::Color& color);

/// The attributes of a run, such as "Times 12 bold, red, centred"; "plain" when it has none.
std::string styleWords(const toolkit::TextAttributes& attributes);

/// When something happens that so many seconds are left to: "in 2.5 s", or, from a year on,
/// "practically never".
std::string whenWords(double seconds);

/// A number in as few digits as say it, such as "12" or "12.5".
std::string numberWords(double number);

/// What the control says to its user: the title of a button, the text of anything else.
const toolkit::AttributedString& captionOf(const ControlPicture& control);

/// The caption without its attributes, or the image of an image view.
std::string contentOf(const ControlPicture& control);

/// What is worth knowing about the control beside its content, such as "hidden" or "tooltip “…”".
std::vector<std::string> remarksOn(const ControlPicture& control);

/// The same about a window: its size, whether it is seen, its background.
std::vector<std::string> remarksOn(const toolkit::WindowPicture& window);

}  // namespace tools::play
