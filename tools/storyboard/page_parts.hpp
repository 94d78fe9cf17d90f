// SPDX-License-Identifier: MIT
// The style and the program of pages, as texts.
#pragma once

#include <string_view>

namespace qz::tools::storyboard {

/// Returns page.css as it was at the build.
std::string_view pageStyle();
/// Returns page.js as it was at the build. Neither has the character sequence "</".
std::string_view pageProgram();
/// Returns the SHA-256 of `pageProgram`, in hexadecimal digits.
std::string_view pageProgramHash();

}  // namespace qz::tools::storyboard
