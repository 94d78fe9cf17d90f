// SPDX-License-Identifier: MIT
// What is said of a walk-through in steps.
#pragma once

#include <vector>

#include "tools/check/finding.hpp"

namespace qz::tools::check {

/// Replaces the help of findings, which speaks of lists and commands, by that for authors of steps.
/// Removes findings about lists that nothing runs: these are of steps before another start.
void speakOfSteps(std::vector<Finding>& findings);

}  // namespace qz::tools::check
