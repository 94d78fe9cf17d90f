// SPDX-License-Identifier: MIT
// The rows of the table of toolkits agree with the drivers that they make.

#include <gtest/gtest.h>

#include <cstdlib>

#include "tools/support/drivers.hpp"

namespace qz {

namespace {

TEST(ToolkitRows, AgreeWithTheirDrivers) {
  int drivers = 0;
  for (const tools::ToolkitRow& row : tools::toolkits()) {
    if (!row.make) continue;
    // AppKit needs a display; the test appkit:rows has one.
    if (row.name == "appkit" && !std::getenv("DISPLAY")) continue;
    ++drivers;
    const auto driver = row.make();
    EXPECT_EQ(driver->name(), row.name);
    EXPECT_EQ(driver->draws(), row.hasDisplay) << row.name;
  }
  EXPECT_GE(drivers, 2);
}

}  // namespace

}  // namespace qz
