// SPDX-License-Identifier: MIT
// Making a driver of the Qt toolkit, for programs that know nothing else of Qt.
#pragma once

#include <memory>

#include "toolkit/test_driver.hpp"

namespace toolkit::qt {

/// A driver with a Qt toolkit of its own. Makes the application object where there is none.
std::unique_ptr<TestDriver> makeQtDriver();

}  // namespace toolkit::qt
