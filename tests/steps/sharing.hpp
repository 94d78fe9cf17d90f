// SPDX-License-Identifier: MIT
// What parts of walk-throughs in steps take from others.
#pragma once

#include "tests/steps/written_tour.hpp"

namespace qz::meaning {

/// Returns what is said, and otherwise the other words.
Words joined(Words said, Words otherwise);
Part joined(Part said, Part otherwise);

/// Returns the part with everything that it uses, and that the step says which it is like.
Part completed(const Tour& tour, const Part& part, const Arguments& arguments = {});

}  // namespace qz::meaning
