// SPDX-License-Identifier: MIT
// Plays a path from its beginning in a fresh world, as a user would, and says what each move
// changes.
#pragma once

#include <functional>
#include <string>
#include <vector>

#include "tools/exploration/move.hpp"
#include "tools/exploration/world.hpp"
#include "tools/walkthrough/step_picture.hpp"

namespace qz::tools::check {

/// Plays a path. Stops before a move that would run lists without end.
std::vector<PlayedMove> playPath(const Setting& setting, const Path& path);

/// One move of a path, as it was played.
struct SeenMove {
  const Step& step;
  const walkthrough::StepPicture& before;
  const walkthrough::StepPicture& after;
  bool raised = false;  ///< an exception reached the host
};

/// Plays a path and calls `see` after each move. Stops before a move that would run lists without
/// end.
void playEach(const Setting& setting, const Path& path,
              const std::function<void(const SeenMove&)>& see);

/// Returns what the walk-through shows after a path, which must not run lists without end.
walkthrough::StepPicture pictureAfter(const Setting& setting, const Path& path);

}  // namespace qz::tools::check
