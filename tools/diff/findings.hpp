// SPDX-License-Identifier: MIT
// Which findings of `check` came and which went.
#pragma once

#include <vector>

#include "tools/check/finding.hpp"
#include "tools/diff/both.hpp"

namespace qz::tools::diff {

/// Returns the findings that only the old script has, and those that only the new one has. Two
/// findings are the same one if they have the same code and words; or else, since lists may have
/// other keys now, the same code and tag.
Both<std::vector<check::Finding>> findingsOfOne(const Both<std::vector<check::Finding>>& all);

}  // namespace qz::tools::diff
