// SPDX-License-Identifier: MIT
// Playing a script: what `qz-walkthrough play` does once its command line is read.
#pragma once

#include <iosfwd>
#include <optional>
#include <string>
#include <variant>
#include <vector>

#include "toolkit/tag.hpp"
#include "tools/failure.hpp"
#include "tools/play/picture_render.hpp"

namespace tools::play {

/// The user presses the control with this tag.
struct Press {
  toolkit::Tag tag = 0;
};

/// Time passes.
struct Advance {
  double seconds = 0;
};

using Step = std::variant<Press, Advance>;

/// The longest time that may pass in one step, in seconds: a day.
inline constexpr double longestAdvance = 24 * 3600;

struct PlayOptions {
  std::string script;                    ///< path of the script
  std::optional<std::string> window;     ///< path of the host's window; or
  std::optional<std::string> assets;     ///< path of a description of which the engine builds one
  std::string startKey;                  ///< empty: the smallest tag
  std::optional<std::string> resources;  ///< directory of named images; absent: the script's own
  std::vector<Step> steps;               ///< what happens after the start, in order
  bool sheet = false;                    ///< shown as a sheet over another window of the host
  std::string toolkit = "memory";
  std::optional<std::string> screenshots;  ///< directory of a picture for every step
};

/// Whom the player talks with.
struct Terminal {
  std::istream& in;
  std::ostream& out;  ///< the transcript
  std::ostream& log;  ///< the engine's log lines; at the end, what could not be done
  /// Asks for steps when none are given; a person at the toolkit's own screen plays there.
  bool interactive;
  Style style;
};

/// Plays the script and writes the transcript. `failed` when a step could not be made, a list
/// raised, or the walk-through stands still at the end. A Failure when the walk-through cannot
/// start.
ExitStatus play(const PlayOptions& options, const Terminal& terminal);

}  // namespace tools::play
