// SPDX-License-Identifier: MIT
// Which generated scripts can have mutants.
#pragma once

#include <algorithm>

#include "tests/check/script_reading.hpp"

namespace qz::naive {

/// Whether the values of a script are all lists of commands with names.
inline bool hasListsOnly(const Script& script) {
  const auto isCommand = [](const auto& element) {
    const auto compound = toolkit::asArray(element);
    return toolkit::asString(compound->count() > 0 ? compound->objectAtIndex(0) : element);
  };
  const auto entries = script->entries();
  return std::all_of(entries.begin(), entries.end(), [&](const auto& entry) {
    const auto list = toolkit::asArray(entry.value);
    const auto elements = list->elements();
    return list && std::all_of(elements.begin(), elements.end(), isCommand);
  });
}

}  // namespace qz::naive
