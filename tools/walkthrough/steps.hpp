// SPDX-License-Identifier: MIT
// The steps of a walk-through.
#pragma once

#include <string>
#include <variant>

#include "qz/toolkit/tag.hpp"

namespace qz::tools::walkthrough {

/// The user presses the control with this tag, or with this name.
struct Press {
  toolkit::Tag tag = 0;
  std::string name{};  ///< empty: the tag says which control
};

/// Time passes.
struct Advance {
  double seconds = 0;
};

using Step = std::variant<Press, Advance>;

/// The longest time that may pass in one step, in seconds: a day.
inline constexpr double longestAdvance = 24 * 3600;

}  // namespace qz::tools::walkthrough
