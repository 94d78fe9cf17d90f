// SPDX-License-Identifier: MIT
// Checks an exploration itself: reaches a sample of its visits again by playing their paths from
// the beginning, and compares everything.
#pragma once

#include <optional>
#include <string>

#include "tools/exploration/exploration.hpp"

namespace qz::tools::check {

/// Returns the first difference, with the path that shows it; absent if there is none. A difference
/// is a mistake of the exploration, not of the script.
std::optional<std::string> selfCheck(const Exploration& exploration);

}  // namespace qz::tools::check
