// SPDX-License-Identifier: MIT
// The row of the memory toolkit, which every build has.
#pragma once

#include "qz/api.hpp"
#include "qz/drivers/toolkit_row.hpp"

namespace qz::drivers {

/// The memory toolkit.
inline constexpr ToolkitRow memoryRow = {
    .name = "memory",
    .description = "records everything, without a display",
    .howToGet = "",
    .hasDisplay = false,
    .place = 1,
};

/// Makes a driver with its own memory toolkit.
QZ_API std::unique_ptr<Driver> makeMemoryDriver();

}  // namespace qz::drivers
