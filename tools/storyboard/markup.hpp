// SPDX-License-Identifier: MIT
// Texts and bytes as HTML has them.
#pragma once

#include <string>
#include <string_view>

namespace qz::tools::storyboard {

/// Returns the text as the content of an element or as an attribute's value in double quotes.
/// Control and direction characters become escapes such as "\u{1b}"; of a very long text only the
/// beginning is there, and how much is missing.
std::string html(std::string_view text);

/// Returns the bytes that pairs of hexadecimal digits stand for.
std::string fromHex(std::string_view digits);

}  // namespace qz::tools::storyboard
