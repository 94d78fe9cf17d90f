// SPDX-License-Identifier: MIT
// The row of AppKit, so that scenarios can name it. There is no such toolkit yet.
#pragma once

#include "qz/drivers/toolkit_row.hpp"

namespace qz::drivers {

/// AppKit.
inline constexpr ToolkitRow appkitRow = {
    .name = "appkit",
    .description = "windows of AppKit",
    .howToGet = "there is no such toolkit yet",
    .hasDisplay = true,
    .place = 3,
};

}  // namespace qz::drivers
