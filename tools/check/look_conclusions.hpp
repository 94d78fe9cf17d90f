// SPDX-License-Identifier: MIT
// What follows from what the controls show.
#pragma once

#include <vector>

#include "tools/check/finding.hpp"
#include "tools/exploration/exploration.hpp"

namespace qz::tools::check {

struct LookOptions {
  double wordsPerMinute = 200;  ///< how fast users read
  unsigned threads = 1;
};

std::vector<Finding> concludeFromLooks(Exploration& exploration, const LookOptions& options);

}  // namespace qz::tools::check
