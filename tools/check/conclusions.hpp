// SPDX-License-Identifier: MIT
// What follows from an exploration.
#pragma once

#include <vector>

#include "tools/check/finding.hpp"
#include "tools/exploration/exploration.hpp"

namespace qz::tools::check {

/// Returns the findings that need exploring. `read` is what was read off the script: what it says
/// is not said again. If there is no host's window (`isStandIn`), says nothing about targets.
std::vector<Finding> conclude(Exploration& exploration, const std::vector<Finding>& read,
                              bool isStandIn, unsigned threads);

}  // namespace qz::tools::check
