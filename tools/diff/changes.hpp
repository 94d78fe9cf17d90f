// SPDX-License-Identifier: MIT
// What a user would notice if one walk-through took the place of another.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "tools/comparison/behavior.hpp"
#include "tools/diff/both.hpp"
#include "tools/diff/controls.hpp"
#include "tools/diff/properties.hpp"
#include "tools/diff/step_names.hpp"

namespace qz::tools::diff {

/// A control, or the window, of which a property has another value.
struct ControlChange {
  std::optional<std::size_t> control{};  ///< a joint one; absent: the window
  PropertyChange property{};

  friend auto operator<=>(const ControlChange&, const ControlChange&) = default;
};

/// One thing that a user notices, and the shortest way to see it.
struct Change {
  enum class Kind : std::uint8_t {
    goneStep,  ///< nothing leads to a step any more
    newStep,   ///< nothing led to it before
    move,      ///< a press, a wait or the start leads elsewhere
    wait,      ///< the time until something happens by itself
    look       ///< a control looks different
  };
  Kind kind = Kind::look;
  /// The steps at which, or from which; empty in the walk-through that does not have it.
  Both<StepName> step{};
  /// Of a move: the steps to which it leads.
  Both<StepName> target{};
  Both<std::optional<double>> seconds{};  ///< of a wait; absent: nothing happens by itself
  std::optional<std::size_t> pressed{};   ///< of a move: a joint control; absent: not a press
  bool isStart = false;                   ///< of a move
  std::vector<ControlChange> controls{};  ///< one of a look; of a move, what differs at the targets
  Both<check::Path> path{};               ///< empty in the walk-through that does not have it
  /// Where the path leads; absent: nowhere.
  Both<std::optional<comparison::SituationIndex>> at{};
  std::size_t steps = 1;  ///< at how many steps it can be seen

  /// Whether only the words that users read are others.
  bool isWords() const { return kind == Kind::look && controls.front().property.isWords; }
};

/// Returns the name of a kind, such as "gone-step".
std::string nameOf(Change::Kind kind);

}  // namespace qz::tools::diff
