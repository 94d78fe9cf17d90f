// SPDX-License-Identifier: MIT
// Pictures that are the same on every machine.

#include <gtest/gtest.h>

#include <QImage>
#include <QPalette>
#include <string>

#include "drivers/qt/qt_driver.hpp"
#include "qz/toolkit/view.hpp"

namespace qz {

namespace {

using namespace toolkit;

struct DriverDrawing : testing::Test {
  drivers::QtDriver driver;
  Ref<Window> window = driver.makeWindow({100, 100, 300, 200});

  std::string png(double density) { return driver.pngOf(driver.draw(window, density)); }

  QImage draw(double density) {
    return QImage::fromData(QByteArray::fromStdString(png(density)), "PNG");
  }
};

TEST_F(DriverDrawing, HasAsManyPixelsAPointAsWanted) {
  window->setBackgroundColor(colors::red);
  const QImage picture = draw(2);
  ASSERT_EQ(picture.size(), QSize(600, 400));
  EXPECT_EQ(picture.pixelColor(599, 399), QColor(Qt::red));
  EXPECT_EQ(draw(0.5).size(), QSize(150, 100));
}

TEST_F(DriverDrawing, IsTheSameTwiceAndSmall) {
  const auto button =
      driver.makeView(drivers::ViewKind::button, 1, {20, 20, 100, 30}, window->contentView());
  driver.setCaption(button, "Press");
  const std::string picture = png(2);
  EXPECT_EQ(png(2), picture);
  EXPECT_LT(picture.size(), 20'000U);
  EXPECT_TRUE(draw(2).allGray()) << "which takes a byte a pixel";
  driver.setCaption(button, "Pressed");
  EXPECT_NE(png(2), picture);
}

TEST_F(DriverDrawing, IsOfNoWindowThatIsNotShown) {
  window->orderOut();
  EXPECT_EQ(driver.draw(window, 2), drivers::Pixels());
}

}  // namespace

}  // namespace qz
