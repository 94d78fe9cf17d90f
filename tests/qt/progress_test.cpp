// SPDX-License-Identifier: MIT
// How far a walk-through in a Qt window is.

#include <QPushButton>
#include <QSignalSpy>

#include "qz/hosts/progress/exploring_meter.hpp"
#include "qz/hosts/qt/walk_through.hpp"
#include "tests/qt/support.hpp"

namespace qz {

namespace {

using hosts::progress::exploringMeter;
using hosts::qt::WalkThrough;

// Four presses lead from the beginning to the end. Aside leads away from it, and Skip nearer.
const QByteArray fourSteps =
    "{ 0 = ((HIDE_OBJECT_WITH_ID, 9));"
    "  1 = ((SET_TAG_FOR_OBJECT_ID, 2, 1)); 2 = ((SET_TAG_FOR_OBJECT_ID, 3, 2));"
    "  3 = ((SET_TAG_FOR_OBJECT_ID, 4, 3)); 4 = (TERMINATE_PARSER);"
    "  8 = ((SHOW_OBJECT_WITH_ID, 9), (DISABLE_OBJECT_WITH_ID, 1));"
    "  9 = ((HIDE_OBJECT_WITH_ID, 9), (ENABLE_OBJECT_WITH_ID, 1)); }";

struct Progress : testing::Test {
  QWidget window;
  QPushButton next{"Next", &window};
  QPushButton aside{"Aside", &window};
  QPushButton back{"Back", &window};
  WalkThrough walkThrough;

  Progress() {
    next.setProperty("qzTag", 1);
    aside.setProperty("qzTag", 8);
    back.setProperty("qzTag", 9);
    walkThrough.toolkit().log().setSink([](std::string_view) {});
    window.show();
  }

  bool isKnown() {
    return QTest::qWaitFor([this] { return walkThrough.progress() >= 0; }, 10000);
  }
  double after(QPushButton& button) {
    button.click();
    hosts::settle();
    return walkThrough.progress();
  }
};

TEST_F(Progress, IsNotKnownWithoutAMeter) {
  ASSERT_TRUE(walkThrough.play(fourSteps, window));
  EXPECT_EQ(after(next), -1);
}

TEST_F(Progress, IsTheShareOfTheShortestWayThatIsDone) {
  walkThrough.setProgressMeter(exploringMeter());
  QSignalSpy changes(&walkThrough, &WalkThrough::progressChanged);
  ASSERT_TRUE(walkThrough.play(fourSteps, window));
  ASSERT_TRUE(isKnown());
  EXPECT_EQ(walkThrough.progress(), 0);
  EXPECT_EQ(walkThrough.property("progress"), 0);
  EXPECT_EQ(after(aside), 0) << "less than nothing is nothing";
  EXPECT_EQ(after(back), 0);
  EXPECT_EQ(after(next), 0.25);
  EXPECT_EQ(after(aside), 0.25) << "the button that Aside disables has another tag now";
  EXPECT_EQ(after(next), 0.5);
  EXPECT_EQ(after(next), 0.75);
  EXPECT_EQ(after(next), 1);
  EXPECT_FALSE(walkThrough.isRunning());
  QList<double> told;
  for (const auto& change : changes) told << change[0].toDouble();
  EXPECT_EQ(told, (QList<double>{0, 0.25, 0.5, 0.75, 1}));
  ASSERT_TRUE(walkThrough.play(fourSteps, window));
  EXPECT_EQ(walkThrough.progress(), -1) << "of the next one";
}

TEST_F(Progress, CountsTheTimersThatArePending) {
  walkThrough.setProgressMeter(exploringMeter());
  ASSERT_TRUE(walkThrough.play(
      QByteArray("{ 0 = (); 1 = ((SET_TIMER_FOR_ID, 50, 7)); 7 = (TERMINATE_PARSER); }"), window));
  ASSERT_TRUE(isKnown());
  EXPECT_EQ(after(next), 0.5);
  EXPECT_EQ(after(aside), 0) << "which cancels the timer";
}

TEST_F(Progress, IsNotKnownWhereTheHostHasChangedTheWindow) {
  walkThrough.setProgressMeter(exploringMeter());
  ASSERT_TRUE(walkThrough.play(fourSteps, window));
  ASSERT_TRUE(isKnown());
  aside.setEnabled(false);
  EXPECT_EQ(after(next), -1);
  aside.setEnabled(true);
  EXPECT_EQ(after(next), 0.5);
}

TEST_F(Progress, IsNotKnownIfThereIsNoEnd) {
  walkThrough.setProgressMeter(exploringMeter());
  ASSERT_TRUE(walkThrough.play(QByteArray("{ 0 = (); 1 = (); }"), window));
  EXPECT_FALSE(QTest::qWaitFor([this] { return walkThrough.progress() >= 0; }, 300));
}

// Each of the buttons can be pressed or not: 2 to the power of `buttons` places.
QByteArray counter(QWidget& window, int buttons) {
  QByteArray script = "{ 0 = (); 1 = ((SET_TAG_FOR_OBJECT_ID, 2, 1)); 2 = (TERMINATE_PARSER);";
  for (int i = 100; i < 100 + buttons; ++i) {
    (new QPushButton("Count", &window))->setProperty("qzTag", i);
    script += QString(" %1 = ((SET_TAG_FOR_OBJECT_ID, %2, %1));").arg(i).arg(i + 100).toUtf8();
  }
  return script + " }";
}

TEST_F(Progress, IsExploredWithinBoundsAndKnownOnlyWhereItIsCertain) {
  walkThrough.setProgressMeter(exploringMeter({.places = 600}));
  ASSERT_TRUE(walkThrough.play(counter(window, 12), window));
  ASSERT_TRUE(isKnown());
  const auto buttons = window.findChildren<QPushButton*>();
  EXPECT_EQ(walkThrough.progress(), 0);
  for (int i = 0; i < 9; ++i) after(*buttons[3 + i]);
  EXPECT_EQ(walkThrough.progress(), -1) << "so far nobody has looked";
  EXPECT_EQ(after(next), -1);
  EXPECT_EQ(after(next), 1);
}

TEST_F(Progress, IsLeftUnknownByTheEndOfTheWalkThrough) {
  // Bounds that the exploration does not reach before the end, even on a busy machine.
  walkThrough.setProgressMeter(
      exploringMeter({.places = 100'000'000, .bytes = std::size_t{8} << 30U, .seconds = 600}));
  const QByteArray script = counter(window, 30);
  for (int i = 0; i < 20; ++i) {
    ASSERT_TRUE(walkThrough.play(script, window));
    if (i % 2) hosts::settle();
  }
  walkThrough.end();
  EXPECT_EQ(walkThrough.progress(), -1);
  walkThrough.setProgressMeter(nullptr);
}

}  // namespace

}  // namespace qz
