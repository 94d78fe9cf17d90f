// SPDX-License-Identifier: MIT
// Tags: the numbers by which scripts name controls.
#pragma once

#include <cstdint>

namespace toolkit {

/// A control's tag: a signed integer of 64 bits wherever the program runs, also where `long`
/// has 32. So a script means the same control everywhere.
using Tag = std::int64_t;

}  // namespace toolkit
