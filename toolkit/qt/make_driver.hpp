// SPDX-License-Identifier: MIT
// Makes a driver of the Qt toolkit for programs that use nothing else of Qt.
#pragma once

#include <memory>

#include "toolkit/test_driver.hpp"

namespace toolkit::qt {

/// Makes a driver with its own Qt toolkit. Makes the application object if there is none.
std::unique_ptr<TestDriver> makeQtDriver();

}  // namespace toolkit::qt
