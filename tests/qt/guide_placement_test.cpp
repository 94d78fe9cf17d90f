// SPDX-License-Identifier: MIT
// Where the guide's panel goes.

#include "hosts/qt/guide_placement.hpp"

#include <gtest/gtest.h>

#include <random>

namespace qz {

namespace {

using hosts::qt::placeBeside;
using hosts::qt::Surroundings;

constexpr QRect screen(0, 0, 800, 600);
constexpr QSize panel(200, 100);
constexpr QRect all = screen;  // a window that fills the screen, so that it makes no difference

TEST(GuidePlacement, PrefersToFollowItsTargetThenBelowThenBeforeThenAbove) {
  const struct {
    const char* where;
    QRect target;
    QPoint ltr;
    QPoint rtl;
  } cases[] = {
      {"middle", {300, 250, 100, 30}, {408, 250}, {92, 250}},
      {"right edge", {700, 250, 100, 30}, {600, 288}, {492, 250}},
      {"left edge", {0, 250, 100, 30}, {108, 250}, {0, 288}},
      {"bottom right corner", {700, 570, 100, 30}, {492, 500}, {492, 500}},
      {"bottom left corner", {0, 570, 100, 30}, {108, 500}, {108, 500}},
      {"whole width", {0, 250, 800, 30}, {0, 288}, {600, 288}},
      {"whole width, at the bottom", {0, 500, 800, 100}, {0, 392}, {600, 392}},
      {"whole height, at the right", {500, 0, 300, 600}, {292, 0}, {292, 0}},
  };
  for (const auto& c : cases) {
    EXPECT_EQ(placeBeside({screen, all, c.target, Qt::LeftToRight}, panel), QRect(c.ltr, panel))
        << c.where;
    EXPECT_EQ(placeBeside({screen, all, c.target, Qt::RightToLeft}, panel), QRect(c.rtl, panel))
        << c.where;
  }
}

TEST(GuidePlacement, CoversTheWindowAsLittleAsItCan) {
  const QRect window(100, 100, 300, 300);
  EXPECT_EQ(placeBeside({screen, window, {300, 200, 90, 30}}, panel).topLeft(), QPoint(398, 200))
      << "the place after it is nearly outside";
  EXPECT_EQ(placeBeside({screen, window, {110, 300, 270, 30}}, panel).topLeft(), QPoint(388, 300));
  EXPECT_EQ(placeBeside({screen, {450, 100, 340, 300}, {460, 360, 320, 30}}, panel).topLeft(),
            QPoint(252, 360))
      << "there is no room after it, and below it covers a little of the window";
}

TEST(GuidePlacement, IsInTheMiddleOfTheWindowWithoutATarget) {
  EXPECT_EQ(placeBeside({screen, {100, 100, 400, 300}, {}}, panel), QRect({200, 200}, panel));
  EXPECT_EQ(placeBeside({screen, {700, 500, 400, 300}, {}}, panel), QRect({600, 500}, panel));
}

TEST(GuidePlacement, CoversAsLittleAsItCanOfATargetThatLeavesNoRoom) {
  const QRect place = placeBeside({screen, all, {50, 50, 700, 520}}, panel);
  EXPECT_TRUE(screen.contains(place));
  const QRect covered = place & QRect(50, 50, 700, 520);
  EXPECT_LE(covered.width() * covered.height(), 150 * 70);
}

TEST(GuidePlacement, BeginsAtTheBeginningOfAnAreaThatIsTooSmall) {
  EXPECT_EQ(placeBeside({{10, 20, 100, 50}, all, {}}, panel).topLeft(), QPoint(10, 20));
}

// Wherever a side has room, the target is not covered; and the panel never leaves the area.
TEST(GuidePlacement, NeverCoversATargetThatLeavesRoom) {
  std::mt19937 random(7);
  const auto upTo = [&](int most) { return std::uniform_int_distribution(0, most)(random); };
  for (int i = 0; i < 20000; ++i) {
    const QRect area(upTo(300) - 150, upTo(300) - 150, 250 + upTo(900), 150 + upTo(600));
    const QRect target = QRect(area.left() + upTo(area.width()), area.top() + upTo(area.height()),
                               1 + upTo(600), 1 + upTo(400)) &
                         area;
    if (target.isEmpty()) continue;
    const QRect window(area.left() + upTo(area.width()), area.top(), 1 + upTo(500), 1 + upTo(500));
    const QRect place =
        placeBeside({area, window, target, i % 2 ? Qt::LeftToRight : Qt::RightToLeft}, panel);
    ASSERT_TRUE(area.contains(place));
    ASSERT_EQ(place.size(), panel);
    const int beside = std::max(target.left() - area.left(), area.right() - target.right());
    const int above = std::max(target.top() - area.top(), area.bottom() - target.bottom());
    const bool hasRoom = beside >= panel.width() + 8 || above >= panel.height() + 8;
    ASSERT_TRUE(!hasRoom || !place.intersects(target));
  }
}

}  // namespace

}  // namespace qz
