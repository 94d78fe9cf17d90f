// SPDX-License-Identifier: MIT
// The driver's pictures of windows, and its name.

#include <gtest/gtest.h>
#include <unistd.h>

#include <QImage>
#include <QWidget>
#include <filesystem>
#include <string>

#include "drivers/qt/qt_driver.hpp"
#include "toolkit/qt/window.hpp"

namespace qz {

namespace {

using namespace toolkit;

struct DriverPictures : testing::Test {
  drivers::QtDriver driver;
  Ref<Window> panel = driver.makeWindow({100, 100, 300, 200});
  Ref<Window> sheet = driver.makeWindow({0, 0, 120, 80});
  std::string path = std::filesystem::temp_directory_path() /
                     ("driver-pictures-" + std::to_string(::getpid()) + ".png");

  DriverPictures() {
    panel->setBackgroundColor(colors::red);
    sheet->setBackgroundColor(colors::blue);
  }
  ~DriverPictures() override { std::filesystem::remove(path); }

  QImage save(const Ref<Window>& window) {
    EXPECT_TRUE(driver.savePicture(window, path));
    return QImage(QString::fromStdString(path));
  }
};

TEST_F(DriverPictures, ShowASheetOverItsParent) {
  driver.toolkit().application().beginSheet(sheet, panel, {}, nullptr);
  driver.advance(0);
  const QImage picture = save(sheet);
  const double ratio = picture.devicePixelRatio();
  ASSERT_EQ(picture.size(), QSize(300, 200) * ratio);
  const auto colorAt = [&](int x, int y) {
    return picture.pixelColor(QPoint(x, y) * static_cast<int>(ratio));
  };
  EXPECT_EQ(colorAt(150, 40), QColor(Qt::blue)) << "the sheet, at the top in the middle";
  EXPECT_EQ(colorAt(95, 5), QColor(Qt::blue));
  EXPECT_EQ(colorAt(85, 40), QColor(Qt::red)) << "its parent beside it";
  EXPECT_EQ(colorAt(150, 90), QColor(Qt::red)) << "its parent below it";
}

TEST_F(DriverPictures, ShowASheetThatIsLargerThanItsParentInFull) {
  qt::QtWindow::of(sheet)->widget()->resize(400, 250);
  driver.toolkit().application().beginSheet(sheet, panel, {}, nullptr);
  driver.advance(0);
  const QImage picture = save(sheet);
  EXPECT_GE(picture.width(), 400 * picture.devicePixelRatio());
  EXPECT_GE(picture.height(), 250 * picture.devicePixelRatio());
  const auto isBlueAt = [&](int x) { return picture.pixelColor(x, 10) == QColor(Qt::blue); };
  EXPECT_TRUE(isBlueAt(2)) << "left of the parent";
  EXPECT_TRUE(isBlueAt(picture.width() - 2)) << "right of the parent";
  EXPECT_EQ(picture.pixelColor(picture.width() / 2, picture.height() - 2), QColor(Qt::blue));
}

TEST_F(DriverPictures, AreNotMadeOfWindowsOffTheScreen) {
  panel->orderOut();
  EXPECT_FALSE(driver.savePicture(panel, path));
  EXPECT_FALSE(driver.savePicture(nullptr, path));
  EXPECT_FALSE(std::filesystem::exists(path));
}

TEST(DriverName, IsTheOneThatTheCommandLineTakes) { EXPECT_EQ(drivers::QtDriver().name(), "qt"); }

}  // namespace

}  // namespace qz
