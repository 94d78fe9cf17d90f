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

  QImage draw(double density) {
    const std::string png = driver.drawPicture(window, density);
    return QImage::fromData(QByteArray::fromStdString(png), "PNG");
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
  const std::string picture = driver.drawPicture(window, 2);
  EXPECT_EQ(driver.drawPicture(window, 2), picture);
  EXPECT_LT(picture.size(), 20'000U);
  EXPECT_EQ(draw(2).format(), QImage::Format_Indexed8) << "few colours have a table";
  driver.setCaption(button, "Pressed");
  EXPECT_NE(driver.drawPicture(window, 2), picture);
}

TEST_F(DriverDrawing, IsOfNoWindowThatIsNotShown) {
  window->orderOut();
  EXPECT_EQ(driver.drawPicture(window, 2), "");
}

}  // namespace

}  // namespace qz
