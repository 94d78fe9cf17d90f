// SPDX-License-Identifier: MIT
// Scripts with one mistake that an author could make.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "tests/check/script_reading.hpp"

namespace qz::naive {

struct Mutant {
  enum class Mistake {
    dropped,      ///< a command is missing
    otherTag,     ///< a command names another tag
    misspelt,     ///< the name of a command lacks a letter
    timerMoved,   ///< a timer is started at the end of another list
    listsSwapped  ///< two lists that follow each other have each other's keys
  };

  Mistake mistake;
  std::string words;  ///< what is different, for failing tests
  Script script;
};

/// Returns the mutants of a script whose values are arrays: each command dropped, each tag changed,
/// each name misspelt, each timer moved, each list swapped with the next one. The seed decides the
/// details, the same on every platform.
std::vector<Mutant> mutantsOf(const Script& script, std::uint64_t seed);

}  // namespace qz::naive
