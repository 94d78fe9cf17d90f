// SPDX-License-Identifier: MIT
// Where the moves out of one visit lead.
#pragma once

#include <cstdint>
#include <optional>
#include <vector>

#include "tools/exploration/exploration.hpp"

namespace qz::tools::check {

struct Exploration::Found {
  Arrival arrival;
  PendingTimers timers;
  std::size_t firstFact = 0;             // among those of the expansion
  std::optional<std::uint64_t> hash{};   // of the place; absent if its timers have no number yet
  std::optional<std::uint32_t> place{};  // its number, if it was known before
  bool isNews = true;                    // the visit adds something to what was known before
};

struct Exploration::Expansion {
  static constexpr std::size_t largestRound = 4096;  // visits that are expanded together

  // What the moves depend on: it stays where it is while other visits are merged.
  std::uint32_t visit = 0;
  std::uint32_t look = 0;
  const std::uint8_t* from = nullptr;   // the place
  const Looks::Parts* parts = nullptr;  // of the look
  const PendingTimers* pending = nullptr;

  std::vector<Found> found;
  std::vector<std::uint8_t> places;  // of `found`, one after the other
  std::vector<Fact> facts;
  // By move: where the move leads if that adds nothing to what was known, else `noPlace`. Apart
  // from `found`, because the merging thread looks at no more of most moves.
  std::vector<std::uint32_t> known;
  std::size_t waits = 0;  // among the moves
  bool runsList = false;  // one of the moves does
};

}  // namespace qz::tools::check
