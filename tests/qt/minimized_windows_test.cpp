// SPDX-License-Identifier: MIT
// Windows that the user minimized.

#include "tests/qt/support.hpp"

namespace qz {

namespace {

using MinimizedWindows = hosts::Host;

TEST_F(MinimizedWindows, AreRestoredWhenTheyAreOrderedToTheFront) {
  show();
  panel->showMinimized();
  ASSERT_TRUE(panel->isMinimized());
  window->makeKeyAndOrderFront();
  EXPECT_FALSE(panel->isMinimized());
  EXPECT_TRUE(panel->isVisible());
}

}  // namespace

}  // namespace qz
