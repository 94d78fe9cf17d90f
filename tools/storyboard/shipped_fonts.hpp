// SPDX-License-Identifier: MIT
// The fonts that are built into the tool, so that pictures are the same on every machine.
#pragma once

#include <span>
#include <string_view>

namespace qz::tools::storyboard {

/// Returns the bytes of font files: the regular one first.
std::span<const std::string_view> shippedFonts();

}  // namespace qz::tools::storyboard
