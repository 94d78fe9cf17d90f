// SPDX-License-Identifier: MIT
// The errors and warnings of a check that a source asks for.
#pragma once

#include <set>
#include <string>

#include "tests/steps/source_generator.hpp"

namespace qz::meaning {

struct Asked {
  std::set<std::string> must{};  ///< codes of which the check finds one; empty: none is due
  std::set<std::string> may{};   ///< codes that it may find, those included
};

/// Returns what the source asks for, as the interpreter says. Any other error or warning is the
/// fault of the script that was built.
Asked askedFor(const Generated& generated);

}  // namespace qz::meaning
