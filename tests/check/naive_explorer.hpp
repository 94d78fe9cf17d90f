// SPDX-License-Identifier: MIT
// A second opinion on what can happen when a script is played, for the tests of the checker: goes
// through everything that a user can do, in the plainest way. Every path is replayed from its
// beginning on a new engine, and everything is kept and compared in full.
#pragma once

#include <cstddef>
#include <set>
#include <string>
#include <vector>

#include "qz/property_list/collections.hpp"
#include "tests/check/finding.hpp"
#include "tests/check/move.hpp"
#include "tools/walkthrough/host_window.hpp"

namespace qz::naive {

struct Exploration {
  /// Each as one line: every control back to front, the window, the pending timers, whether there
  /// is a script, and whether the walk-through has ended.
  std::set<std::string> places;
  std::size_t presses = 0;  ///< that lead from all places together
  std::size_t waits = 0;
  bool complete = true;  ///< NO if the limit kept a place out
  std::vector<Finding> findings;
};

/// Explores a script over a host's window from each of the keys (an empty one is the smallest tag;
/// without any key, from the smallest tag), up to so many places. `resources` is the directory of
/// the images; if it is empty, the toolkit's own.
Exploration explore(const toolkit::ValueRef<toolkit::Dictionary>& script,
                    const tools::walkthrough::HostWindow& host,
                    const std::vector<std::string>& startKeys, std::size_t placeLimit,
                    const std::string& resources = "");

}  // namespace qz::naive
