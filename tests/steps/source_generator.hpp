// SPDX-License-Identifier: MIT
// Walk-throughs in steps, made at random.
#pragma once

#include <cstdint>
#include <optional>
#include <string>

#include "tests/check/draft.hpp"
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

/// Returns the source of the tour; absent if it has too many places, or a step that is in none.
std::optional<Generated> sourceOf(const Tour& tour, naive::Dice& dice);

}  // namespace qz::meaning
