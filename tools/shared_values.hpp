// SPDX-License-Identifier: MIT
// Guards against binary property lists that are small but stand for more than any memory holds:
// they may have one collection in many places, and such collections in one another.
#pragma once

#include "tools/play/input_file.hpp"

namespace tools {

/// A Failure when what the file stands for, written out in full, is out of all proportion to it.
void requireWritableInFull(const play::InputFile& file);

}  // namespace tools
