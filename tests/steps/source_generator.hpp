// SPDX-License-Identifier: MIT
// Walk-throughs in steps, made at random.
#pragma once

#include <cstdint>
#include <string>

#include "tests/steps/places.hpp"
#include "tests/steps/written_tour.hpp"

namespace qz::meaning {

struct Generated {
  Tour tour{};
  Places places{};     ///< every step is in one of them
  std::string yaml{};  ///< the source
  std::string window{};
};

/// The names of the images that sources may show.
inline constexpr const char* pictures[] = {"disk", "meadow"};

/// Returns the source of the seed, the same on every platform.
Generated generate(std::uint64_t seed);

}  // namespace qz::meaning
