// SPDX-License-Identifier: MIT
// The table of the toolkits, of which a build of the tool has some. The row of a toolkit is in
// qz/drivers/NAME/toolkit_row.hpp.
#pragma once

#include <memory>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "qz/drivers/driver.hpp"
#include "qz/drivers/toolkit_row.hpp"

namespace qz::tools {

using drivers::ToolkitRow;

/// Returns all toolkits in the order of their places, also those that this build is without.
std::span<const ToolkitRow> toolkits();

/// Returns the names of all toolkits, which scenarios accept.
std::vector<std::string_view> toolkitNames();

/// Returns the names of the toolkits of this build, which `--toolkit` accepts.
std::vector<std::string_view> driverNames();

/// Returns the default toolkit for running scenarios, which every build has.
std::string testToolkit();

/// Returns the default toolkit for playing scripts: one that shows windows, if the build has one.
std::string playerToolkit();

/// Lists the toolkits of this build with their descriptions, for the help of `--toolkit`.
std::string toolkitHelp();

/// Makes a driver with its own toolkit; null if this build has no toolkit of that name.
std::unique_ptr<drivers::Driver> makeDriver(std::string_view name);

/// The same, but throws a Failure instead of returning null.
std::unique_ptr<drivers::Driver> requireDriver(std::string_view name);

}  // namespace qz::tools
