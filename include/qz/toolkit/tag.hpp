// SPDX-License-Identifier: MIT
// Tags: the numbers by which scripts refer to controls.
#pragma once

#include <cstdint>

namespace qz::toolkit {

/// A control's tag: a signed 64-bit integer on every platform, even where `long` has 32 bits, so
/// that a script means the same control everywhere.
using Tag = std::int64_t;

}  // namespace qz::toolkit
