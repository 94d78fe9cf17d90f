// SPDX-License-Identifier: MIT
// Descriptions from which the engine builds a walk-through window.
#pragma once

#include "tools/support/input_file.hpp"

namespace qz::tools::walkthrough {

/// Throws a Failure if the engine could not read the whole description: it must have an entry, and
/// every entry must be an array of a class name and four numbers. Accepts what the engine ignores.
void checkGuiDescription(const InputFile& file);

}  // namespace qz::tools::walkthrough
