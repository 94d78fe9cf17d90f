// SPDX-License-Identifier: MIT
// Where the moves out of one visit lead.
#pragma once

#include <cstdint>
#include <vector>

#include "tools/check/exploration.hpp"

namespace qz::tools::check {

struct Exploration::Expansion {
  static constexpr std::size_t largestRound = 4096;  // visits that are expanded together

  struct Found {
    Arrival arrival;
    PendingTimers timers;
    std::size_t firstFact = 0;
  };

  std::uint32_t visit = 0;
  std::vector<Found> found;
  std::vector<std::uint8_t> places;  // of `found`, one after the other
  std::vector<Fact> facts;
};

}  // namespace qz::tools::check
