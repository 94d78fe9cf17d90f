// SPDX-License-Identifier: MIT
// Tours that say a little less, to find the smallest one that still goes wrong.
#pragma once

#include <vector>

#include "tests/steps/written_tour.hpp"

namespace qz::meaning {

/// Returns the tours that lack one thing. Some of them may not be correct.
std::vector<Tour> smallerThan(const Tour& tour);

}  // namespace qz::meaning
