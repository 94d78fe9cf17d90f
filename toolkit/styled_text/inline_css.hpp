// SPDX-License-Identifier: MIT
// The style sheets in `style` attributes.
#pragma once

#include <optional>
#include <string_view>

#include "toolkit/styled_text/html_style.hpp"

namespace toolkit::html {

/// "left", "right", "center", "justify" and their like; absent where it is none.
std::optional<TextAlignment> alignmentNamed(std::string_view value);

/// Adds what `css` says, such as "color: red; font-size: 14pt", to what the element declares. A
/// property that the reader does not know, or a value that is not valid, says nothing.
void readInlineStyle(std::string_view css, const Fonts& fonts, Declarations& own);

}  // namespace toolkit::html
