// SPDX-License-Identifier: MIT
// What follows from the places of an exploration and what can be reached from them.
#pragma once

#include <vector>

#include "tools/check/finding.hpp"
#include "tools/exploration/exploration.hpp"

namespace qz::tools::check {

std::vector<Finding> concludeFromPlaces(Exploration& exploration, unsigned threads);

}  // namespace qz::tools::check
