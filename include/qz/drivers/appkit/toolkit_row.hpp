// SPDX-License-Identifier: MIT
// The row of the AppKit toolkit. This header uses nothing of AppKit.
#pragma once

#include "qz/api.hpp"
#include "qz/drivers/toolkit_row.hpp"

namespace qz::drivers {

/// AppKit.
inline constexpr ToolkitRow appkitRow = {
    .name = "appkit",
    .description = "windows of AppKit, of macOS or GNUstep",
    .howToGet =
        "install GNUstep and GCC's Objective-C++ (scripts/setup appkit, on Debian), then configure "
        "and build again",
    .hasDisplay = true,
    .place = 3,
};

/// Makes a driver with its own AppKit toolkit. Makes the application object if the program does not
/// have one. Raises if no display can be opened.
QZ_API std::unique_ptr<Driver> makeAppkitDriver();

}  // namespace qz::drivers
