// SPDX-License-Identifier: MIT
// Images: their place and their sharpness.

#include "toolkit/qt/image_look.hpp"

#include <gtest/gtest.h>

#include <QFrame>
#include <QLabel>
#include <QTemporaryDir>

#include "qz/toolkit/system_files.hpp"
#include "tests/qt/rendering.hpp"
#include "toolkit/qt/images.hpp"
#include "toolkit/qt/strings.hpp"

namespace qz {

namespace {

using namespace toolkit;
using namespace toolkit::qt;
using namespace rendering;

/// A resource directory with images that the test writes.
class ImageLook : public ::testing::Test {
 protected:
  ImageLook() { files_.setResourcePath(utf8(directory_.path())); }

  void write(const QString& name, const QSize& size, const QColor& color) {
    QImage image(size, QImage::Format_RGB32);
    image.fill(color);
    ASSERT_TRUE(image.save(directory_.filePath(name)));
  }
  Ref<Image> named(const char* name) { return images_.imageNamed(name); }

  static bool isRed(const QColor& color) { return color == QColor(Qt::red); }
  static bool isBlue(const QColor& color) { return color == QColor(Qt::blue); }

  QTemporaryDir directory_;
  SystemFiles files_;
  QtImages images_{files_};
};

TEST_F(ImageLook, ShrinksProportionallyAndNeverEnlarges) {
  struct Case {
    QSize image;
    QSize label;
    QRect shown;
  };
  const Case cases[] = {
      {{40, 20}, {100, 60}, {30, 20, 40, 20}},   // fits: original size, centred
      {{200, 100}, {100, 60}, {0, 5, 100, 50}},  // too wide
      {{50, 120}, {100, 60}, {38, 0, 25, 60}},   // too high
  };
  for (const Case& test : cases) {
    write("a.png", test.image, Qt::red);
    QtImages images(files_);
    QLabel label;
    label.resize(test.label);
    showImage(label, images.imageNamed("a"));
    for (const int ratio : {1, 2}) {
      const QRect bounds = boundsOf(pictureOf(label, ratio), isRed);
      const QRect shown(test.shown.topLeft() * ratio, test.shown.size() * ratio);
      EXPECT_EQ(bounds.size(), shown.size()) << test.image.width() << " at " << ratio;
      EXPECT_LE((bounds.topLeft() - shown.topLeft()).manhattanLength(), ratio);
    }
  }
}

TEST_F(ImageLook, TakesTheFileOfTwiceTheResolutionWhereThePixelsAre) {
  write("a.png", {20, 20}, Qt::red);
  write("a@2x.png", {40, 40}, Qt::blue);
  QLabel label;
  label.resize(40, 40);
  showImage(label, named("a"));
  EXPECT_EQ(boundsOf(pictureOf(label), isRed).size(), QSize(20, 20));
  EXPECT_EQ(boundsOf(pictureOf(label, 2), isBlue).size(), QSize(40, 40));
}

TEST_F(ImageLook, IsSharpAtTwoPixelsAPoint) {
  QImage stripes(40, 40, QImage::Format_RGB32);
  for (int y = 0; y < 40; ++y) {
    for (int x = 0; x < 40; ++x) stripes.setPixelColor(x, y, x % 2 == 0 ? Qt::red : Qt::blue);
  }
  ASSERT_TRUE(stripes.save(directory_.filePath("a@2x.png")));
  write("a.png", {20, 20}, Qt::white);
  QLabel label;
  label.resize(20, 20);
  showImage(label, named("a"));
  EXPECT_EQ(countPixels(pictureOf(label, 2), isRed), 800);
  EXPECT_EQ(countPixels(pictureOf(label, 2), isBlue), 800);
}

TEST_F(ImageLook, IsReadBackUntilTheHostShowsAnother) {
  write("a.png", {20, 20}, Qt::red);
  QLabel label;
  EXPECT_FALSE(shownImage(label));
  const auto image = named("a");
  showImage(label, image);
  EXPECT_EQ(shownImage(label), image);
  label.setPixmap(QPixmap(5, 5));
  EXPECT_FALSE(shownImage(label));
  showImage(label, image);
  showImage(label, nullptr);
  EXPECT_FALSE(shownImage(label));
  EXPECT_TRUE(label.pixmap(Qt::ReturnByValue).isNull());
  EXPECT_TRUE(label.children().isEmpty());
}

TEST_F(ImageLook, FillsTheLayerBehindTheSubviews) {
  write("a.png", {10, 20}, Qt::red);
  QWidget content;
  content.resize(100, 80);
  auto* const subview = new QFrame(&content);
  subview->setGeometry(10, 10, 20, 20);
  subview->setAutoFillBackground(true);
  subview->setPalette(QPalette(Qt::blue, Qt::blue));

  showLayerContents(content, named("a"));
  EXPECT_FALSE(layerContents(content)) << "without a layer";
  setLayered(content, true);
  showLayerContents(content, named("a"));
  EXPECT_EQ(layerContents(content), named("a"));
  for (const int ratio : {1, 2}) {
    const QImage picture = pictureOf(content, ratio);
    EXPECT_EQ(countPixels(picture, isRed), (100 * 80 - 20 * 20) * ratio * ratio);
    EXPECT_EQ(countPixels(picture, isBlue), 20 * 20 * ratio * ratio);
  }
  content.resize(140, 90);
  EXPECT_EQ(countPixels(pictureOf(content), isRed), 140 * 90 - 20 * 20) << "after resizing";
  showLayerContents(content, nullptr);
  EXPECT_EQ(countPixels(pictureOf(content), isRed), 0);
  setLayered(content, false);
  EXPECT_FALSE(isLayered(content));
}

TEST_F(ImageLook, KnowsTheSameImageByItsName) {
  write("a.png", {2, 2}, Qt::red);
  EXPECT_EQ(named("a"), named("a"));
  EXPECT_EQ(named("a")->name(), "a");
  EXPECT_FALSE(named("b"));
  EXPECT_FALSE(named("../a"));
}

}  // namespace

}  // namespace qz
