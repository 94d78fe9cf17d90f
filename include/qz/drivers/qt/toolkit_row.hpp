// SPDX-License-Identifier: MIT
// The row of the Qt toolkit. This header uses nothing of Qt.
#pragma once

#include "qz/api.hpp"
#include "qz/drivers/toolkit_row.hpp"

namespace qz::drivers {

/// The Qt toolkit.
inline constexpr ToolkitRow qtRow = {
    .name = "qt",
    .description = "windows of Qt 6 Widgets",
    .howToGet =
        "install Qt 6.4 Widgets or later (scripts/setup qt, on Debian), then configure and build "
        "again",
    .hasDisplay = true,
    .place = 2,
};

/// Makes a driver with its own Qt toolkit. Makes the application object if there is none.
QZ_API std::unique_ptr<Driver> makeQtDriver();

}  // namespace qz::drivers
