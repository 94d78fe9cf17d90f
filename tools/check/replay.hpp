// SPDX-License-Identifier: MIT
// Plays a path from its beginning in a fresh world, as a user would, and says what each move
// changes.
#pragma once

#include <string>
#include <vector>

#include "tools/exploration/move.hpp"
#include "tools/exploration/world.hpp"
#include "tools/walkthrough/step_picture.hpp"

namespace qz::tools::check {

/// Plays a path. Stops before a move that would run lists without end.
std::vector<PlayedMove> playPath(const Setting& setting, const Path& path);

/// Returns what the walk-through shows after a path, which must not run lists without end.
walkthrough::StepPicture pictureAfter(const Setting& setting, const Path& path);

}  // namespace qz::tools::check
