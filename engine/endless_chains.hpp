// SPDX-License-Identifier: MIT
// Endless chains: lists of a script that run each other without end.
//
// The engine sets no limit to chaining, so such a script exhausts the stack. Which lists do is
// known beforehand, as a run takes every list from its first element to its last: of a list that
// chains to some that come back and some that do not, the first that does not is where the run
// stays. Only the end of the walk-through cuts a list short.
#pragma once

#include <cstddef>
#include <map>
#include <optional>
#include <string>
#include <vector>

#include "toolkit/property_list/collections.hpp"

struct EndlessChains {
  /// Each loop once, as its lists' keys in the order in which they run: "3 -> 7 -> 3".
  std::vector<std::string> loops;
  /// For every list that never comes to its end, the loop (by its place in `loops`) it ends up in.
  std::map<std::string, std::size_t, std::less<>> loopOf;
};

/// The key of the list that an element chains to, where it does; `own` is the key under whose id
/// the element runs, which a simple command aims at.
std::optional<std::string> chainTarget(const toolkit::ValueRef<>& element, const std::string& own);

/// The endless chains of a script; what in it is no list chains to nothing.
EndlessChains endlessChains(const toolkit::ValueRef<toolkit::Dictionary>& script);
