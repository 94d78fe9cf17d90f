// SPDX-License-Identifier: MIT
// Makes a walk-through in steps of a script.
#pragma once

#include <string>

#include "tools/comparison/behavior.hpp"
#include "tools/support/input_file.hpp"

namespace qz::tools::lift {

struct LiftOptions {
  std::string window{};  ///< the line of the source that names the window
  check::ExplorationLimits limits{};
  unsigned threads = 1;
  check::ExplorationHooks hooks{};
};

/// A source that was made of a script.
struct Lifted {
  std::string source{};
  std::size_t steps = 0;
};

/// Returns a source whose script is no different for users: both were compared at every place.
/// `file` is the script. Throws a Failure if the language cannot say what the script does: its
/// message has the place in the script and the reason; or if there are more places than the limits
/// allow.
Lifted liftScript(const InputFile& file, const comparison::Played& played,
                  const LiftOptions& options);

}  // namespace qz::tools::lift
