// SPDX-License-Identifier: MIT
// Walks through two walk-throughs side by side and collects what a user would notice.
#pragma once

#include <vector>

#include "tools/diff/changes.hpp"
#include "tools/diff/faces.hpp"

namespace qz::tools::diff {

/// What was compared.
struct Comparison {
  std::vector<Change> changes{};  ///< by kind; of one kind, the nearest first
  bool isComplete = true;         ///< NO if something was not explored or not compared
};

/// Compares two walk-throughs, the start with each start key of the one with that of the other.
/// None of the changes means that users cannot tell one from the other, if that is complete. At
/// most `mostPairs` pairs of situations are compared.
Comparison compare(const Behaviors& behaviors, const JointControls& controls,
                   std::size_t mostPairs);

}  // namespace qz::tools::diff
