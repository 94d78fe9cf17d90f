// SPDX-License-Identifier: MIT
// Shows the attributes of a text as JSON.
#pragma once

#include <string>

#include "qz/styled_text/attributed_string.hpp"
#include "tools/scenario/json.hpp"

namespace qz::tools::scenario {

/// Shows one attribute as JSON; absent if the text does not set it.
using ShowAttribute = std::optional<Json> (*)(const toolkit::TextAttributes& attributes);

// These show, in turn: "Times 12"; "center"; "#rrggbb"; the address; YES or NO for the others.
std::optional<Json> showFont(const toolkit::TextAttributes& attributes);
std::optional<Json> showAlignment(const toolkit::TextAttributes& attributes);
std::optional<Json> showForeground(const toolkit::TextAttributes& attributes);
std::optional<Json> showLink(const toolkit::TextAttributes& attributes);
std::optional<Json> showBold(const toolkit::TextAttributes& attributes);
std::optional<Json> showItalic(const toolkit::TextAttributes& attributes);
std::optional<Json> showUnderline(const toolkit::TextAttributes& attributes);

/// Shows the attribute if it is the same over the whole text, else "mixed". An empty text shows the
/// same as a text without attributes.
std::optional<Json> showThroughout(const toolkit::AttributedString& text, ShowAttribute attribute);

/// Shows the text as a list of [text, {attributes}], without attributes that are not set, NO or
/// natural.
Json showRuns(const toolkit::AttributedString& text);

/// Returns "#rrggbb", followed by the alpha if the colour is not opaque.
std::string showColor(const toolkit::Color& color);

}  // namespace qz::tools::scenario
