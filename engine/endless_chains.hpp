// SPDX-License-Identifier: MIT
// Endless chains: lists of a script that run each other endlessly.
//
// The engine does not limit chaining, so such a script exhausts the stack. These lists can be found
// without running the script, because a run executes every list from its first element to its last
// and only the end of the walk-through cuts it short: a list is endless if it chains to an endless
// one before the end, and a run stays in the first such list.
#pragma once

#include <cstddef>
#include <map>
#include <optional>
#include <string>
#include <vector>

#include "qz/property_list/collections.hpp"

namespace qz {

struct EndlessChains {
  /// Each loop once, as the keys of its lists in running order: "3 -> 7 -> 3".
  std::vector<std::string> loops;
  /// For every list that never ends, the index in `loops` of the loop that it enters.
  std::map<std::string, std::size_t, std::less<>> loopOf;
};

/// Returns the key of the list that an element chains to; absent if it does not chain. `own` is the
/// key of the id under which the element runs, the target of a simple command.
std::optional<std::string> chainTarget(const toolkit::ValueRef<>& element, const std::string& own);

/// Finds the endless chains of a script. A value that is not a list chains to nothing.
EndlessChains endlessChains(const toolkit::ValueRef<toolkit::Dictionary>& script);

}  // namespace qz
