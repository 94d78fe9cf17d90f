// SPDX-License-Identifier: MIT
// The order in which people, and screen readers for them, read a window.
#pragma once

#include <cstddef>
#include <vector>

#include "tools/walkthrough/step_picture.hpp"

namespace qz::tools::storyboard {

/// Returns the indices of the controls that are shown: rows from top to bottom, each from the left.
std::vector<std::size_t> readingOrder(const walkthrough::StepPicture& picture);

}  // namespace qz::tools::storyboard
