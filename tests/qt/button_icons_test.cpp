// SPDX-License-Identifier: MIT
// Buttons that a host gave an icon, a description or a menu keep them when a script changes the
// title.

#include <gtest/gtest.h>

#include <QCommandLinkButton>
#include <QIcon>
#include <QMenu>
#include <QPixmap>
#include <QPushButton>
#include <QStyle>
#include <QStyleFactory>
#include <QToolButton>
#include <memory>

#include "tests/qt/rendering.hpp"
#include "toolkit/qt/button_look.hpp"

namespace qz {

namespace {

using namespace toolkit;
using namespace toolkit::qt;
using namespace rendering;

bool isBluish(const QColor& color) {
  return color.blue() > color.green() + 60 && color.blue() > color.red() + 60;
}

QIcon blueIcon() {
  QPixmap picture(16, 16);
  picture.fill(Qt::blue);
  return {picture};
}

AttributedString inRed(const std::string& title) {
  return AttributedString(title, {.foregroundColor = colors::red});
}

TEST(ButtonIcons, StandBesideTitlesWithAttributes) {
  for (const auto direction : {Qt::LeftToRight, Qt::RightToLeft}) {
    SCOPED_TRACE(direction);
    QPushButton button(blueIcon(), "Title");
    button.setLayoutDirection(direction);
    button.setIconSize({16, 16});
    button.resize(160, 40);
    showTitle(button, inRed("Title"));
    const QImage picture = pictureOf(button);
    EXPECT_EQ(countPixels(picture, isBluish), 16 * 16);
    const QRect icon = boundsOf(picture, isBluish);
    const QRect title = boundsOf(picture, isReddish);
    EXPECT_FALSE(title.isEmpty());
    EXPECT_FALSE(icon.intersects(title));
    EXPECT_EQ(icon.center().x() < title.center().x(), direction == Qt::LeftToRight);
  }
}

TEST(ButtonIcons, AreGreyedInDisabledButtons) {
  QPushButton button(blueIcon(), "Title");
  button.resize(160, 40);
  showTitle(button, inRed("Title"));
  EXPECT_GT(countPixels(pictureOf(button), isBluish), 0);
  button.setEnabled(false);
  EXPECT_EQ(countPixels(pictureOf(button), isBluish), 0);
}

TEST(ButtonDescriptions, StayBelowTheTitlesOfCommandLinks) {
  QCommandLinkButton link("Title", "A description");
  link.setIcon(QIcon());
  link.resize(220, 80);
  const QRect before = boundsOf(pictureOf(link).copy(0, 34, 220, 36), isDark);
  ASSERT_FALSE(before.isEmpty());
  showTitle(link, inRed("Title"));
  const QImage after = pictureOf(link);
  EXPECT_EQ(boundsOf(after.copy(0, 34, 220, 36), isDark), before);
  const QRect title = boundsOf(after, isReddish);
  EXPECT_FALSE(title.isEmpty());
  EXPECT_LT(title.bottom(), 34);
}

TEST(ButtonMenus, AreMarkedByAnArrowBesideTitlesWithAttributes) {
  const std::unique_ptr<QStyle> style(QStyleFactory::create("Fusion"));
  QMenu menu;
  QToolButton button;
  button.setStyle(style.get());
  button.setText("Title");
  button.setMenu(&menu);
  button.setPopupMode(QToolButton::InstantPopup);
  button.resize(120, 40);
  showTitle(button, inRed("Title"));
  const QRect corner(110, 30, 8, 8);
  const int marked = countPixels(pictureOf(button), corner, isDark);
  button.setMenu(nullptr);
  const int unmarked = countPixels(pictureOf(button), corner, isDark);
  EXPECT_GT(marked, unmarked + 4);
  button.setStyle(nullptr);
}

TEST(ButtonTitles, ShowTheBeginningOfEachLineIfTheLinesDoNotFit) {
  QPushButton button;
  button.resize(120, 24);
  showTitle(button, inRed("MMMM MMMM MMMM MMMM MMMM MMMM MMMM"));
  const QRect wrapped = boundsOf(pictureOf(button), isReddish);
  QPushButton narrow;
  narrow.resize(120, 24);
  showTitle(narrow, inRed("MMMM"));
  const QRect oneLine = boundsOf(pictureOf(narrow), isReddish);
  EXPECT_EQ(wrapped.top(), oneLine.top()) << "the upper half of several lines";
  EXPECT_EQ(wrapped.height(), oneLine.height());
  EXPECT_GT(wrapped.width(), 90);
}

}  // namespace

}  // namespace qz
