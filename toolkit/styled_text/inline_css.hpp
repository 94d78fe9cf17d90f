// SPDX-License-Identifier: MIT
// Reads the style sheets in `style` attributes.
#pragma once

#include <optional>
#include <string_view>

#include "toolkit/styled_text/html_style.hpp"

namespace qz::toolkit::html {

/// Returns the alignment named "left", "right", "center", "justify" and the like; absent if it is
/// none.
std::optional<TextAlignment> alignmentNamed(std::string_view value);

/// Adds the declarations of `css`, such as "color: red; font-size: 14pt", to `own`. Ignores unknown
/// properties and invalid values.
void readInlineStyle(std::string_view css, const Fonts& fonts, Declarations& own);

}  // namespace qz::toolkit::html
