// SPDX-License-Identifier: MIT
// Patches make one picture of another.
#include "tools/drawing/patches.hpp"

#include <gtest/gtest.h>

namespace qz::tools::drawing {
namespace {

using drivers::Pixels;

/// Returns a picture of one colour.
Pixels plainPicture(int width, int height, std::uint32_t color) {
  return {width, height,
          std::vector<std::uint32_t>(
              static_cast<std::size_t>(width) * static_cast<std::size_t>(height), color)};
}

void setPixel(Pixels& picture, int x, int y, std::uint32_t color) {
  picture.argb[static_cast<std::size_t>(y * picture.width + x)] = color;
}

TEST(Patches, AreWhatIsDifferentInTheAreasAndElsewhere) {
  const Pixels ground = plainPicture(40, 20, 0xffffffff);
  Pixels picture = ground;
  setPixel(picture, 3, 4, 1);
  setPixel(picture, 5, 6, 2);
  setPixel(picture, 39, 19, 3);
  const Area areas[] = {{0, 0, 10, 10}, {20, 0, 10, 10}};
  const auto found = patches(ground, picture, areas);
  ASSERT_EQ(found.size(), 2U) << "the second area is the same";
  EXPECT_EQ(found[0].area, (Area{0, 0, 12, 12})) << "with a margin";
  EXPECT_EQ(found[1].area, (Area{32, 12, 8, 8}));
  Pixels made = ground;
  for (const auto& [area, pixels] : found) {
    for (int i = 0; i < area.width * area.height; ++i) {
      setPixel(made, area.x + i % area.width, area.y + i / area.width,
               pixels.argb[static_cast<std::size_t>(i)]);
    }
  }
  EXPECT_EQ(made, picture);
  EXPECT_TRUE(patches(picture, picture, areas).empty());
}

TEST(Patches, AreaOfAControlIsInThePicture) {
  const Pixels picture = plainPicture(200, 100, 0);
  EXPECT_EQ(areaOf({10, 20, 30, 10}, 50, 2, picture), (Area{20, 40, 60, 20}));
  EXPECT_EQ(areaOf({90, -20, 30, 30}, 50, 2, picture), (Area{180, 80, 20, 20}));
}

}  // namespace
}  // namespace qz::tools::drawing
