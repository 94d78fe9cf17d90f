// SPDX-License-Identifier: MIT
// The toolkits that this build of the tool has, by name.
#pragma once

#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "toolkit/test_driver.hpp"

namespace tools {

/// The names that `--toolkit` takes.
std::vector<std::string_view> driverNames();

/// The toolkit to play scripts on where none is asked for: one with windows to see, if this build
/// has one.
std::string playerToolkit();

/// A driver with a toolkit of its own; null when this build has none of that name.
std::unique_ptr<toolkit::TestDriver> makeDriver(std::string_view name);

/// The same, but a Failure where that gives null.
std::unique_ptr<toolkit::TestDriver> requireDriver(std::string_view name);

}  // namespace tools
