// SPDX-License-Identifier: MIT
// The toolkits that this build of the tool has, by name.
#pragma once

#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "drivers/driver.hpp"

namespace qz::tools {

/// Returns the names that `--toolkit` accepts.
std::vector<std::string_view> driverNames();

/// Returns the default toolkit for playing scripts: one that shows windows, if the build has one.
std::string playerToolkit();

/// Makes a driver with its own toolkit; null if this build has no toolkit of that name.
std::unique_ptr<drivers::Driver> makeDriver(std::string_view name);

/// The same, but throws a Failure instead of returning null.
std::unique_ptr<drivers::Driver> requireDriver(std::string_view name);

}  // namespace qz::tools
