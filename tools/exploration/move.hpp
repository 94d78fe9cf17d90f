// SPDX-License-Identifier: MIT
// What can happen in a walk-through, and sequences of it.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <variant>
#include <vector>

#include "qz/toolkit/tag.hpp"

namespace qz::tools::check {

/// The walk-through starts with the list under a key.
struct StartMove {
  std::string key;
  friend auto operator<=>(const StartMove&, const StartMove&) = default;
};

/// The user presses a button.
struct PressMove {
  toolkit::Tag tag = 0;
  std::size_t control = 0;  ///< among the window's controls, back to front
  bool isShadowed = false;  ///< a control behind it has the same tag
  friend auto operator<=>(const PressMove&, const PressMove&) = default;
};

/// Time passes until the first pending timer fires.
struct WaitMove {
  double seconds = 0;
  friend auto operator<=>(const WaitMove&, const WaitMove&) = default;
};

using Step = std::variant<StartMove, PressMove, WaitMove>;

/// A walk from the start.
using Path = std::vector<Step>;

/// One move of a path that was played.
struct PlayedMove {
  std::string words;                 ///< such as "press 2"
  std::vector<std::string> changes;  ///< such as `5: text “Hello”`; in the order of the controls
  bool raised = false;               ///< an exception reached the host
  bool isEndless = false;            ///< the move would run lists without end, and was not made
};

/// A move out of a place, in few bytes: the press of a control by its index, or a wait.
using Move = std::uint32_t;
inline constexpr Move waitMove = 0xffffffff;

}  // namespace qz::tools::check
