// SPDX-License-Identifier: MIT
// Finds the buttons that lead back to where the user came from.
#pragma once

#include "tools/lift/walk.hpp"

namespace qz::tools::lift {

/// Returns the walk with presses that lead back where that is what they do. Steps become one that
/// differ only in where they lead back. Without such a button it is the same walk.
Walk withBack(const Behavior& behavior, const Walk& walk);

}  // namespace qz::tools::lift
