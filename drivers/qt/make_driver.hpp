// SPDX-License-Identifier: MIT
// Makes a driver of the Qt toolkit for programs that use nothing else of Qt.
#pragma once

#include <memory>

#include "drivers/driver.hpp"

namespace qz::drivers {

/// Makes a driver with its own Qt toolkit. Makes the application object if there is none.
std::unique_ptr<Driver> makeQtDriver();

}  // namespace qz::drivers
