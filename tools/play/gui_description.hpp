// SPDX-License-Identifier: MIT
// Descriptions of which the engine builds a walk-through window.
#pragma once

#include "tools/play/input_file.hpp"

namespace tools::play {

/// Fails when the engine could not read the description to its end: every entry must be an array of
/// a class name and four numbers, and there must be one. What the engine merely ignores passes.
void checkGuiDescription(const InputFile& file);

}  // namespace tools::play
