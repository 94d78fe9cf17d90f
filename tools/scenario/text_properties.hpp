// SPDX-License-Identifier: MIT
// What the attributes of a text show.
#pragma once

#include <string>

#include "toolkit/styled_text/attributed_string.hpp"
#include "tools/scenario/json.hpp"

namespace tools::scenario {

/// One attribute as JSON; nothing when the text leaves it open.
using ShowAttribute = std::optional<Json> (*)(const toolkit::TextAttributes& attributes);

// "Times 12"; "center"; "#rrggbb"; the address; and YES or NO.
std::optional<Json> showFont(const toolkit::TextAttributes& attributes);
std::optional<Json> showAlignment(const toolkit::TextAttributes& attributes);
std::optional<Json> showForeground(const toolkit::TextAttributes& attributes);
std::optional<Json> showLink(const toolkit::TextAttributes& attributes);
std::optional<Json> showBold(const toolkit::TextAttributes& attributes);
std::optional<Json> showItalic(const toolkit::TextAttributes& attributes);
std::optional<Json> showUnderline(const toolkit::TextAttributes& attributes);

/// What the attribute shows over the whole text, or "mixed". Of an empty text: what a text without
/// attributes shows.
std::optional<Json> showThroughout(const toolkit::AttributedString& text, ShowAttribute attribute);

/// The text as a list of [text, {attributes}], the attributes without those that are left open, NO
/// or natural.
Json showRuns(const toolkit::AttributedString& text);

/// "#rrggbb", with the alpha behind it where the colour is not opaque.
std::string showColor(const toolkit::Color& color);

}  // namespace tools::scenario
