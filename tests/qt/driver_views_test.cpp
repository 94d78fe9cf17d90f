// SPDX-License-Identifier: MIT
// The look of the driver's own views.

#include <gtest/gtest.h>

#include <QWidget>

#include "drivers/qt/qt_driver.hpp"
#include "tests/qt/rendering.hpp"
#include "tests/view_kinds.hpp"
#include "toolkit/qt/widget_node.hpp"

namespace qz {

namespace {

using namespace toolkit;

TEST(DriverViews, AgreeWithTheTableOfKinds) {
  drivers::QtDriver driver;
  expectEveryKindOfView(driver);
}

TEST(DriverViews, DrawPopUpButtonsWithAnArrow) {
  drivers::QtDriver driver;
  const auto window = driver.makeWindow({0, 0, 200, 100});
  const auto view =
      driver.makeView(drivers::ViewKind::popUpButton, 1, {20, 20, 120, 30}, window->contentView());
  const auto arrowIn = [&] {
    const QImage picture = rendering::pictureOf(*qt::WidgetNode::of(view)->widget());
    return rendering::countPixels(picture, QRect(4, 4, 22, 22), rendering::isDark);
  };
  EXPECT_GT(arrowIn(), 8);
  asButton(view)->setAttributedTitle(AttributedString("Red", {.foregroundColor = colors::red}));
  EXPECT_GT(arrowIn(), 8) << "beside a title with attributes";
}

TEST(DriverViews, PlaceTheTitleOfAPopUpButtonBesideItsArrow) {
  drivers::QtDriver driver;
  const auto window = driver.makeWindow({0, 0, 200, 100});
  const auto view =
      driver.makeView(drivers::ViewKind::popUpButton, 1, {20, 20, 120, 30}, window->contentView());
  const auto titleIn = [&](auto wanted) {
    const QImage picture = rendering::pictureOf(*qt::WidgetNode::of(view)->widget());
    return rendering::boundsOf(picture.copy(20, 4, 96, 22), wanted);
  };
  asButton(view)->setTitle("Choice");
  const QRect plain = titleIn(rendering::isDark);
  asButton(view)->setAttributedTitle(AttributedString("Choice", {.foregroundColor = colors::red}));
  EXPECT_NEAR(titleIn(rendering::isReddish).left(), plain.left(), 2);
}

}  // namespace

}  // namespace qz
