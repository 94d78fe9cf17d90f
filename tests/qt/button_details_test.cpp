// SPDX-License-Identifier: MIT
// Buttons that a script has changed still look like buttons, and their titles can be read.

#include <gtest/gtest.h>

#include <QCheckBox>
#include <QCommandLinkButton>
#include <QPushButton>
#include <QRadioButton>
#include <QStyle>
#include <QStyleFactory>
#include <QStyleOptionButton>
#include <algorithm>
#include <memory>

#include "tests/qt/rendering.hpp"
#include "toolkit/qt/button_look.hpp"
#include "toolkit/qt/contrast.hpp"

namespace qz {

namespace {

using namespace toolkit;
using namespace toolkit::qt;
using namespace rendering;

QRect indicatorOf(const QAbstractButton& button) {
  QStyleOptionButton option;
  option.initFrom(&button);
  const bool radio = qobject_cast<const QRadioButton*>(&button);
  return button.style()->subElementRect(
      radio ? QStyle::SE_RadioButtonIndicator : QStyle::SE_CheckBoxIndicator, &option, &button);
}

double shareOfEqual(const QImage& a, const QImage& b, const QRect& area) {
  int equal = 0;
  for (int y = area.top(); y <= area.bottom(); ++y) {
    for (int x = area.left(); x <= area.right(); ++x) {
      if (a.pixel(x, y) == b.pixel(x, y)) ++equal;
    }
  }
  return equal / static_cast<double>(area.width() * area.height());
}

TEST(ButtonDetails, FlashesLeaveTheIndicatorToBeSeen) {
  QCheckBox box("Title");
  QRadioButton radio("Title");
  for (QAbstractButton* const button :
       {static_cast<QAbstractButton*>(&box), static_cast<QAbstractButton*>(&radio)}) {
    for (const char* const style : {"Fusion", "Windows"}) {
      for (const bool on : {false, true}) {
        SCOPED_TRACE(std::string(button->metaObject()->className()) + ", " + style);
        const std::unique_ptr<QStyle> drawn(QStyleFactory::create(style));
        button->setStyle(drawn.get());
        button->setAutoExclusive(false);
        button->resize(160, 40);
        button->setChecked(on);
        button->setDown(true);
        const QImage down = pictureOf(*button);
        button->setDown(false);
        setHighlighted(*button, true);
        const QRect within = indicatorOf(*button).adjusted(3, 3, -3, -3);
        EXPECT_GT(shareOfEqual(pictureOf(*button), down, within), 0.9);
        setHighlighted(*button, false);
        button->setStyle(nullptr);
      }
    }
  }
}

TEST(ButtonDetails, TitlesOfCommandLinksKeepTheirLetters) {
  QCommandLinkButton link("Title");
  link.resize(160, 80);
  const QRect title(36, 0, 120, 80);
  const QRect plain = boundsOf(pictureOf(link).copy(title), isDark);
  showTitle(link, AttributedString("Title", {.foregroundColor = colors::red}));
  const QRect red = boundsOf(pictureOf(link).copy(title), isReddish);
  EXPECT_NEAR(red.left(), plain.left(), 1);
  EXPECT_NEAR(red.width(), plain.width(), 1);
  EXPECT_NEAR(red.top(), plain.top(), 1);
}

TEST(ButtonDetails, BackgroundsDoNotFillTheIndicator) {
  const std::unique_ptr<QStyle> style(QStyleFactory::create("Windows"));
  QRadioButton radio("Title");
  radio.setStyle(style.get());
  radio.resize(160, 40);
  radio.setEnabled(false);
  setFaceColor(radio, colors::red);
  EXPECT_EQ(countPixels(pictureOf(radio), indicatorOf(radio), isReddish), 0);
  radio.setStyle(nullptr);
}

TEST(ButtonDetails, BackgroundsOfCheckBoxesLeaveTheBorderOfAStyleSheet) {
  for (const auto direction : {Qt::LeftToRight, Qt::RightToLeft}) {
    QCheckBox box("Title");
    box.setStyleSheet("QCheckBox { border: 2px solid #00f }");
    box.setLayoutDirection(direction);
    box.resize(160, 40);
    const QImage before = pictureOf(box);
    setFaceColor(box, colors::red);
    const QImage after = pictureOf(box);
    for (const int x : {0, 1, 158, 159}) EXPECT_EQ(after.pixel(x, 20), before.pixel(x, 20)) << x;
  }
}

/// Returns the best contrast of any pixel of the button to its background.
double contrastOfTitle(QWidget& widget) {
  const QImage picture = pictureOf(widget);
  const QColor ground = picture.pixelColor(widget.width() - 12, 12);
  double best = 1;
  for (int y = 6; y < picture.height() - 6; ++y) {
    for (int x = 24; x < picture.width() - 6; ++x) {
      best = std::max(best, contrast(picture.pixelColor(x, y), ground));
    }
  }
  return best;
}

TEST(ButtonDetails, TitlesReadOnBackgroundsWhateverTheColourOfAStyleSheet) {
  QPushButton push("Title");
  QCheckBox box("Title");
  for (QAbstractButton* const button :
       {static_cast<QAbstractButton*>(&push), static_cast<QAbstractButton*>(&box)}) {
    SCOPED_TRACE(button->metaObject()->className());
    button->setStyleSheet("* { color: #ddd; background: #222; font-size: 24px }");
    button->resize(160, 50);
    setFaceColor(*button, colors::red);
    EXPECT_GE(contrastOfTitle(*button), readableContrast);
  }
}

struct Gauge : QAbstractButton {
  Gauge(const QColor& newFace, const QColor& newInk) : face(newFace), ink(newInk) {}
  void paintEvent(QPaintEvent*) override {
    QPainter painter(this);
    painter.fillRect(rect(), face);
    painter.fillRect(40, 15, 60, 10, ink);
  }
  QColor face, ink;
};

TEST(ButtonDetails, BackgroundsLeaveTitlesOfForeignButtonsReadable) {
  const struct {
    Qt::GlobalColor face, ink;
  } cases[] = {{Qt::lightGray, Qt::black}, {Qt::black, Qt::white}, {Qt::darkGray, Qt::white}};
  for (const auto& test : cases) {
    Gauge gauge(test.face, test.ink);
    gauge.resize(160, 40);
    setFaceColor(gauge, colors::red);
    const QImage picture = pictureOf(gauge);
    EXPECT_TRUE(isReddish(picture.pixelColor(10, 10)));
    EXPECT_GT(contrastOfTitle(gauge), 2) << "of " << contrast(test.face, test.ink);
  }
}

}  // namespace

}  // namespace qz
