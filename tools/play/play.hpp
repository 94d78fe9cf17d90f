// SPDX-License-Identifier: MIT
// Plays a script: what `qz-walkthrough play` does once its command line is read.
#pragma once

#include <functional>
#include <iosfwd>
#include <optional>
#include <string>
#include <vector>

#include "tools/play/picture_render.hpp"
#include "tools/support/drivers.hpp"
#include "tools/support/failure.hpp"
#include "tools/walkthrough/stage.hpp"
#include "tools/walkthrough/steps.hpp"

namespace qz::tools::play {

using namespace walkthrough;

struct PlayOptions {
  std::string script;                    ///< path of the script
  StageOptions stage;                    ///< the window that it is played in
  std::string startKey;                  ///< empty: the smallest tag
  std::optional<std::string> resources;  ///< directory of named images; absent: the script's own
  std::vector<Step> steps;               ///< what happens after the start, in order
  std::string toolkit = testToolkit();
  std::optional<std::string> screenshots;  ///< directory for a picture of every step
  /// Called with the script before it starts, and with where to write what is to be said of it.
  std::function<void(const InputFile&, toolkit::Toolkit&, std::ostream&)> scriptLoaded{};
};

/// Where the player reads requests and writes its results.
struct Terminal {
  std::istream& in;
  std::ostream& out;  ///< the transcript
  std::ostream& log;  ///< the engine's log lines; at the end, the problems
  /// Whether to ask for steps if none are given and no person plays at the toolkit's screen.
  bool interactive;
  Style style;
};

/// Plays the script and writes the transcript. Returns `failed` if a step was impossible, a list
/// raised, or the walk-through is stuck at the end. Throws a Failure if it cannot start.
ExitStatus play(const PlayOptions& options, const Terminal& terminal);

}  // namespace qz::tools::play
