// SPDX-License-Identifier: MIT
// Which steps a page shows if there are too many.
#pragma once

#include <cstddef>
#include <vector>

#include "tools/storyboard/board.hpp"

namespace qz::tools::storyboard {

/// Returns the indices of at most `most` steps, in their order: all that fit. Otherwise first one
/// for each list that had the last word, then one for each move out of each list, then one for
/// each look of each list, then the nearest others.
std::vector<StepIndex> selectSteps(const Board& board, std::size_t most);

}  // namespace qz::tools::storyboard
