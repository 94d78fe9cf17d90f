// SPDX-License-Identifier: MIT
// Guards against small binary property lists that no memory could hold when written out: one
// collection may appear in many places, and such collections may be nested.
#pragma once

#include "tools/support/input_file.hpp"

namespace qz::tools {

/// Throws a Failure if the file, written out in full, would be out of all proportion to its size.
void requireWritableInFull(const InputFile& file);

}  // namespace qz::tools
