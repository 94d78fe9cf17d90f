// SPDX-License-Identifier: MIT
// Reads colours of HTML and CSS.
#pragma once

#include <optional>
#include <string_view>

#include "qz/styled_text/color.hpp"

namespace qz::toolkit::html {

/// Returns the colour of a CSS value: a name, "#rgb", "#rrggbb", "rgb(r, g, b)" or "rgba(r, g, b,
/// a)" with numbers up to 255 or percentages. "transparent" has alpha 0. Absent if it is not a
/// colour.
std::optional<Color> cssColor(std::string_view value);

/// Returns the colour of a `color`, `bgcolor`, `text` or `link` attribute: a CSS colour or, for any
/// other value, the colour that browsers have always shown, such as red for "ff0000"; every word
/// has one. Absent if the value is empty or "transparent".
std::optional<Color> attributeColor(std::string_view value);

}  // namespace qz::toolkit::html
