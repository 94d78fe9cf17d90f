// SPDX-License-Identifier: MIT
// How many presses are remembered, and which are forgotten first.

#include "tools/exploration/remembered_presses.hpp"

#include <gtest/gtest.h>

namespace qz::tools::check {
namespace {

/// Places with two buttons, each of which can have many tags.
class RememberedPressesTest : public testing::Test {
 protected:
  static std::vector<Tag> manyTags() {
    std::vector<Tag> tags(30'000);
    for (std::size_t i = 0; i < tags.size(); ++i) tags[i] = static_cast<Tag>(i);
    return tags;
  }
  std::vector<std::uint8_t> placeWith(Tag first, Tag second) const {
    std::vector<std::uint8_t> place(format.size());
    format.setControl(place.data(), 0, {.tag = first});
    format.setControl(place.data(), 1, {.tag = second});
    return place;
  }
  /// Remembers a press of the first button, which looks at both.
  void remember(Tag first, Tag second) {
    const auto place = placeWith(first, second);
    const Station station{place.data(), 0, parts};
    Trace trace;
    trace.addControl(0);
    trace.addControl(1);
    presses.add(0, station, RememberedPress(context, trace, station, station));
  }
  bool remembers(Tag first, Tag second) const {
    const auto place = placeWith(first, second);
    return presses.find(0, {place.data(), 0, parts}) != nullptr;
  }

  PlaceFormat format{2, manyTags()};
  PressContext context{.format = format, .notes = 0};
  Looks::Parts parts = {1, 1};
  RememberedPresses presses{context};
};

TEST_F(RememberedPressesTest, ForgetTheOldestOfAButtonInOneState) {
  for (Tag tag = 0; tag < 64; ++tag) remember(7, tag);
  EXPECT_TRUE(remembers(7, 0));
  EXPECT_FALSE(remembers(8, 0));
  remember(7, 64);
  EXPECT_FALSE(remembers(7, 0));
  EXPECT_TRUE(remembers(7, 1));
  EXPECT_TRUE(remembers(7, 64));
  for (Tag tag = 65; tag < 129; ++tag) remember(7, tag);
  EXPECT_FALSE(remembers(7, 64));
  EXPECT_TRUE(remembers(7, 65));
}

TEST_F(RememberedPressesTest, ForgetAllWhenTheyAreTooMany) {
  for (Tag tag = 0; tag < 20'000; ++tag) remember(tag, 1);
  EXPECT_TRUE(remembers(0, 1));
  remember(20'000, 1);
  EXPECT_FALSE(remembers(0, 1));
  EXPECT_FALSE(remembers(19'999, 1));
  EXPECT_TRUE(remembers(20'000, 1));
}

}  // namespace
}  // namespace qz::tools::check
