// SPDX-License-Identifier: MIT
// What tools know of a toolkit. qz/drivers/NAME/toolkit_row.hpp defines the row of a toolkit, also
// for builds that are without it, and declares the function that makes its driver.
#pragma once

#include <memory>
#include <string_view>

#include "qz/api.hpp"

namespace qz::drivers {

class Driver;

/// What is known of a toolkit.
struct QZ_API ToolkitRow {
  std::string_view name;         ///< for `--toolkit` and in scenarios; the name of its folders
  std::string_view description;  ///< for the help
  /// Says how to get the toolkit if this build lacks it. Ends a message that names the toolkit.
  std::string_view howToGet;
  bool hasDisplay;  ///< whether its windows have pixels
  /// The place in lists, its own for each toolkit. The default for playing is the first toolkit of
  /// the build with a display, the default for tests the first without one.
  int place;
  /// Makes a driver with its own toolkit; null if this build is without the toolkit.
  std::unique_ptr<Driver> (*make)() = nullptr;

  /// Returns the row with `function` as its `make`.
  ToolkitRow madeBy(std::unique_ptr<Driver> (*function)()) const {
    ToolkitRow row = *this;
    row.make = function;
    return row;
  }
};

}  // namespace qz::drivers
