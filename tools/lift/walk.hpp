// SPDX-License-Identifier: MIT
// The steps of a script, which has none: situations that look the same and from which the same
// moves lead to the same.
#pragma once

#include <cstddef>
#include <optional>
#include <vector>

#include "tools/comparison/behavior.hpp"

namespace qz::tools::lift {

using comparison::Behavior;
using comparison::SituationIndex;
using StepIndex = std::size_t;

/// Where a press or a wait leads.
struct Lead {
  enum class Kind { nowhere, step, back, end };
  Kind kind = Kind::nowhere;
  StepIndex step = 0;
  friend bool operator==(const Lead&, const Lead&) = default;
};

struct Step {
  SituationIndex situation = 0;                ///< one that looks like this
  std::vector<std::optional<Lead>> presses{};  ///< of each control that can be pressed
  std::optional<double> seconds{};             ///< of the wait, if there is one
  Lead wait{};
  bool givesUp = false;  ///< a press that leads nowhere ends the wait
  /// The state that the step says of each control; absent: it says none.
  std::vector<std::optional<toolkit::State>> states{};
};

/// The first step is the start.
struct Walk {
  std::vector<Step> steps{};
  bool goesBack = false;  ///< some press leads back
};

/// Which states of buttons tell one step from another.
enum class States {
  ofUser,  ///< none, so that a check box is the user's; not all scripts can be understood so
  exact    ///< those that the user sees
};

/// Returns the walk of a script that starts in a situation and never runs lists without end. Throws
/// an Unsayable if it cannot be understood so.
Walk walkOf(const Behavior& behavior, States states);

}  // namespace qz::tools::lift
