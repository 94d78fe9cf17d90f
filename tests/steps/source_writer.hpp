// SPDX-License-Identifier: MIT
// Writes a walk-through as its files.
#pragma once

#include <string>

#include "tests/check/draft.hpp"
#include "tests/steps/written_tour.hpp"

namespace qz::meaning {

using naive::Dice;

/// Returns the source, in YAML, over the window `host.plist`. The dice choose among the forms in
/// which the same can be said.
std::string yamlOf(const Tour& tour, Dice& dice);

/// Returns the window, as a property list.
std::string windowOf(const Tour& tour);

}  // namespace qz::meaning
