// SPDX-License-Identifier: MIT
// The list of the toolkits, which CMake makes from the folders of drivers/ (CMakeLists.txt).
#pragma once

#include <vector>

#include "qz/drivers/toolkit_row.hpp"

namespace qz::tools {

/// Returns the row of each `qz/drivers/NAME/toolkit_row.hpp`, in the order of the folders' names.
/// Rows of toolkits that this build is without have no `make`.
std::vector<drivers::ToolkitRow> toolkitRows();

}  // namespace qz::tools
