// SPDX-License-Identifier: MIT
// The button loses everything that a script added to it.

#include <gtest/gtest.h>

#include <QApplication>
#include <QPushButton>
#include <QTest>

#include "tests/qt/rendering.hpp"
#include "toolkit/qt/button_look.hpp"
#include "toolkit/qt/user_preferences.hpp"

namespace qz {

namespace {

using namespace toolkit;
using namespace toolkit::qt;
using namespace rendering;

TEST(ButtonLookEnds, AnOutlineGoesAWhileAfterTheLastFlash) {
  QPushButton button("Title");
  button.resize(100, 30);
  const QImage before = pictureOf(button);
  qApp->setProperty(reducedMotionProperty, true);
  setHighlighted(button, true);
  setHighlighted(button, false);
  qApp->setProperty(reducedMotionProperty, QVariant());
  EXPECT_NE(pictureOf(button), before);
  EXPECT_TRUE(QTest::qWaitFor([&] { return button.children().isEmpty(); }, 5000));
  EXPECT_EQ(pictureOf(button), before);
}

TEST(ButtonLookEnds, ATitleThatTheHostReplacesLeavesNothing) {
  QPushButton button("Title");
  button.resize(100, 30);
  showTitle(button, AttributedString("Title", {.foregroundColor = colors::red}));
  EXPECT_FALSE(button.children().isEmpty());
  button.setText("Title");
  showTitle(button, AttributedString("Red", {.foregroundColor = colors::red}));
  button.setText("Host's");
  EXPECT_EQ(countPixels(pictureOf(button), isReddish), 0);
  EXPECT_TRUE(QTest::qWaitFor([&] { return button.children().isEmpty(); }, 5000));
  EXPECT_EQ(button.text().toStdString(), "Host's");
}

}  // namespace

}  // namespace qz
