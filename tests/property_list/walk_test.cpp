// SPDX-License-Identifier: MIT
// How many values a walk visits, counted without walking.
#include "toolkit/property_list/walk.hpp"

#include <gtest/gtest.h>

#include <cstddef>
#include <limits>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/scalars.hpp"

namespace qz::toolkit {
namespace {

/// Returns an array that holds `inner` twice, which holds its own content twice, and so on.
ValueRef<> doubled(ValueRef<> inner, std::size_t times) {
  for (std::size_t i = 0; i < times; ++i) inner = Array::make({inner, inner});
  return inner;
}

TEST(Visits, CountEveryValueAndKeyAsOftenAsItIsHeld) {
  const ValueRef<> text = String::make("a");
  const ValueRef<> pair = Array::make({text, Number::withLong(1)});
  const struct {
    const char* value;
    ValueRef<> root;
    std::size_t visits;
  } cases[] = {
      {"nothing", nullptr, 1},
      {"a scalar", text, 1},
      {"an empty array", Array::make(), 1},
      {"an empty dictionary", Dictionary::make(), 1},
      {"a set", Set::make({text, Number::withLong(1)}), 3},
      {"an array", pair, 3},
      {"a scalar after an array", Array::make({pair, text}), 5},
      {"a scalar held twice", Array::make({text, text}), 3},
      {"an array held twice", Array::make({pair, pair}), 7},
      {"an array held twice, and scalars", Array::make({text, pair, text, pair, text}), 10},
      {"a dictionary", Dictionary::make({{String::make("k"), text}}), 3},
      {"a dictionary of arrays",
       Dictionary::make({{String::make("k"), pair}, {String::make("l"), pair}}), 9},
      {"arrays in arrays", doubled(pair, 2), 15},
  };
  for (const auto& [value, root, visits] : cases) EXPECT_EQ(visitsInWalk(*root), visits) << value;
}

TEST(Visits, StopAtTheGreatestNumber) {
  constexpr std::size_t greatest = std::numeric_limits<std::size_t>::max();
  constexpr std::size_t bits = std::numeric_limits<std::size_t>::digits;
  const ValueRef<> text = String::make("a");
  EXPECT_EQ(visitsInWalk(*doubled(text, bits - 2)), greatest / 2);
  EXPECT_EQ(visitsInWalk(*doubled(text, bits - 1)), greatest);
  EXPECT_EQ(visitsInWalk(*doubled(text, bits)), greatest);
  EXPECT_EQ(visitsInWalk(*doubled(text, 300)), greatest);
}

}  // namespace
}  // namespace qz::toolkit
