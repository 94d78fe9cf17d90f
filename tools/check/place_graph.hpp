// SPDX-License-Identifier: MIT
// What can be reached from which place.
#pragma once

#include <cstdint>
#include <vector>

#include "tools/exploration/exploration.hpp"

namespace qz::tools::check {

/// Places that can all be reached from each other; or a single place.
struct PlaceCircle {
  std::vector<std::uint32_t> places;  ///< ascending
  bool reachesEnd = false;            ///< some way leads to the end
  bool reachesList = false;           ///< some way runs a list
  bool isLast = true;                 ///< no way leads out
  bool isEnd = false;                 ///< the walk-through is over
};

/// Returns the circles of a complete exploration, each after all circles that it leads to.
std::vector<PlaceCircle> circlesOf(const Exploration& exploration);

}  // namespace qz::tools::check
