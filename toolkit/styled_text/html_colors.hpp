// SPDX-License-Identifier: MIT
// Colours as HTML and CSS write them.
#pragma once

#include <optional>
#include <string_view>

#include "toolkit/styled_text/color.hpp"

namespace toolkit::html {

/// What the CSS value says: a name, "#rgb", "#rrggbb", "rgb(r, g, b)" or "rgba(r, g, b, a)" with
/// numbers up to 255 or percentages. "transparent" has alpha 0. Absent where it is no colour.
std::optional<Color> cssColor(std::string_view value);

/// What the value of a `color`, `bgcolor`, `text` or `link` attribute says: a CSS colour, and
/// otherwise what browsers have always made of it: "ff0000" is red, and no word is without a
/// colour. Absent where the value is empty or "transparent".
std::optional<Color> attributeColor(std::string_view value);

}  // namespace toolkit::html
