// SPDX-License-Identifier: MIT
// Where a move has led, and what was seen on the way.
#pragma once

#include <cstdint>
#include <optional>
#include <vector>

#include "tools/exploration/move.hpp"

namespace qz::tools::check {

/// Where a move has led.
struct Arrival {
  Move move = 0;
  bool isEndless = false;  ///< the move runs lists without end, and leads nowhere
  bool ranList = false;
  std::optional<std::uint32_t> firstList{};   ///< that the move ran; absent if it ran none
  std::optional<std::uint32_t> lastList{};    ///< whose command ran last; absent if none ran
  std::vector<std::uint32_t> watchedLists{};  ///< those of the setting that the move ran
  std::uint32_t look = 0;
  std::vector<std::uint32_t> timerElements{};  ///< which started the pending timers
};

}  // namespace qz::tools::check
