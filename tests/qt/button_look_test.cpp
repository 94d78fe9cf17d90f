// SPDX-License-Identifier: MIT
// What buttons show, checked pixel by pixel.

#include "toolkit/qt/button_look.hpp"

#include <gtest/gtest.h>

#include <QApplication>
#include <QCheckBox>
#include <QCommandLinkButton>
#include <QDebug>
#include <QMetaProperty>
#include <QPushButton>
#include <QRadioButton>
#include <QToolButton>
#include <map>
#include <memory>
#include <string>
#include <vector>

#include "tests/qt/rendering.hpp"
#include "toolkit/qt/contrast.hpp"
#include "toolkit/qt/strings.hpp"
#include "toolkit/qt/user_preferences.hpp"

namespace qz {

namespace {

using namespace toolkit;
using namespace toolkit::qt;
using namespace rendering;

AttributedString redTitle(const std::string& text = "Title", double size = 16) {
  return AttributedString(text,
                          {.font = Font{"Times", size, true}, .foregroundColor = colors::red});
}

std::unique_ptr<QAbstractButton> sized(QAbstractButton* button) {
  button->resize(200, 40);
  return std::unique_ptr<QAbstractButton>(button);
}

std::vector<std::unique_ptr<QAbstractButton>> everyButtonKind() {
  std::vector<std::unique_ptr<QAbstractButton>> buttons;
  buttons.push_back(sized(new QPushButton("Plain")));
  buttons.push_back(sized(new QCheckBox("Plain")));
  buttons.push_back(sized(new QRadioButton("Plain")));
  buttons.push_back(sized(new QToolButton));
  return buttons;
}

TEST(ButtonLook, DrawsTheTitlesColourInEveryKindOfButton) {
  for (const auto& button : everyButtonKind()) {
    SCOPED_TRACE(button->metaObject()->className());
    EXPECT_EQ(countPixels(pictureOf(*button), isReddish), 0);
    showTitle(*button, redTitle());
    const int once = countPixels(pictureOf(*button), isReddish);
    EXPECT_GT(once, 50);
    // At two pixels a point, about four times as many pixels are red.
    EXPECT_NEAR(countPixels(pictureOf(*button, 2), isReddish), 4 * once, 1.5 * once);
  }
}

TEST(ButtonLook, ReadsBackTheVeryTitleUntilTheHostChangesIt) {
  QPushButton button("&Next");
  EXPECT_EQ(shownTitle(button), AttributedString("Next"));
  showTitle(button, redTitle("A & B"));
  EXPECT_EQ(shownTitle(button), redTitle("A & B"));
  button.setText("&Host's");
  EXPECT_EQ(shownTitle(button), AttributedString("Host's"));
  EXPECT_EQ(countPixels(pictureOf(button), isReddish), 0);
  showTitle(button, "R&D");
  EXPECT_EQ(button.text().toStdString(), "R&&D");
  EXPECT_EQ(shownTitle(button), AttributedString("R&D"));
}

TEST(ButtonLook, ShowsAllLinesAndMakesRoomForThem) {
  QPushButton button("x");
  const QSize plain = button.sizeHint();
  showTitle(button, redTitle("First\nSecond", 24));
  EXPECT_GE(button.sizeHint().height(), plain.height() + 24);
  button.resize(button.sizeHint());
  const QRect bounds = boundsOf(pictureOf(button), isReddish);
  EXPECT_GT(bounds.height(), 40);
  EXPECT_TRUE(button.rect().adjusted(2, 2, -2, -2).contains(bounds)) << "clipped";
}

TEST(ButtonLook, PlacesTitlesByTheirAlignmentAndTheWritingDirection) {
  QCheckBox box;
  box.resize(300, 30);
  showTitle(box, redTitle());
  EXPECT_LT(boundsOf(pictureOf(box), isReddish).right(), 150);
  box.setLayoutDirection(Qt::RightToLeft);
  EXPECT_GT(boundsOf(pictureOf(box), isReddish).left(), 150);

  QPushButton button;
  button.resize(300, 30);
  showTitle(button, redTitle());
  EXPECT_NEAR(boundsOf(pictureOf(button), isReddish).center().x(), 150, 3);
  AttributedString right = redTitle();
  right.addParagraphStyle(ParagraphStyle{.alignment = TextAlignment::right}, {0, right.length()});
  showTitle(button, right);
  EXPECT_GT(boundsOf(pictureOf(button), isReddish).left(), 220);
}

TEST(ButtonLook, GreysTheTitleOfDisabledButtons) {
  const auto strength = [](const QImage& picture) {
    int strongest = 0;
    countPixels(picture, [&](const QColor& color) {
      strongest = std::max(strongest, color.red() - color.green());
      return false;
    });
    return strongest;
  };
  for (const auto& button : everyButtonKind()) {
    SCOPED_TRACE(button->metaObject()->className());
    showTitle(*button, redTitle());
    const int enabled = strength(pictureOf(*button));
    button->setEnabled(false);
    EXPECT_LT(strength(pictureOf(*button)), enabled * 0.65);
    EXPECT_GT(strength(pictureOf(*button)), enabled * 0.3);
  }
}

/// Returns the properties as text, because some kinds of value cannot be compared.
std::map<std::string, std::string> propertiesOf(const QObject& object) {
  std::map<std::string, std::string> values;
  for (int i = 0; i < object.metaObject()->propertyCount(); ++i) {
    const QMetaProperty property = object.metaObject()->property(i);
    QString words;
    QDebug(&words) << property.read(&object);
    values[property.name()] = words.toStdString();
  }
  return values;
}

TEST(ButtonLook, HighlightingShowsThePressedLookAndChangesNothingElse) {
  auto buttons = everyButtonKind();
  buttons.push_back(sized(new QCommandLinkButton("Link")));
  for (const auto& button : buttons) {
    SCOPED_TRACE(button->metaObject()->className());
    const auto properties = propertiesOf(*button);
    const QImage before = pictureOf(*button);
    setHighlighted(*button, true);
    EXPECT_TRUE(isHighlighted(*button));
    EXPECT_EQ(propertiesOf(*button), properties);
    EXPECT_NE(pictureOf(*button), before);
    setHighlighted(*button, false);
    EXPECT_FALSE(isHighlighted(*button));
    EXPECT_EQ(propertiesOf(*button), properties);
    EXPECT_EQ(pictureOf(*button), before);
    EXPECT_TRUE(button->dynamicPropertyNames().isEmpty());
  }
}

TEST(ButtonLook, OutlinesInsteadOfFlashingWhereNoMotionIsWanted) {
  QPushButton button("Next");
  button.resize(100, 30);
  const QImage before = pictureOf(button);
  const QColor outline = button.palette().color(QPalette::Highlight);
  qApp->setProperty(reducedMotionProperty, true);
  setHighlighted(button, true);
  const QImage on = pictureOf(button);
  setHighlighted(button, false);
  const QImage off = pictureOf(button);
  qApp->setProperty(reducedMotionProperty, QVariant());
  EXPECT_EQ(on, off) << "the outline flickers";
  EXPECT_EQ(on.pixelColor(1, 15), outline);
  EXPECT_EQ(on.pixelColor(50, 28), outline);
  EXPECT_EQ(on.copy(20, 5, 60, 18), before.copy(20, 5, 60, 18)) << "the title changed";
}

TEST(ButtonLook, KeepsTitlesReadableOnAnyFace) {
  for (const Color face : {colors::red, colors::blue, colors::black, colors::white, colors::gray,
                           colors::orange, colors::green}) {
    QPushButton button("MMMM");
    button.resize(120, 40);
    setFaceColor(button, face);
    EXPECT_EQ(faceColor(button), face);
    const QImage picture = pictureOf(button);
    const QColor ground = picture.pixelColor(14, 20);
    double best = 1;
    countPixels(picture, QRect(20, 10, 80, 20), [&](const QColor& color) {
      best = std::max(best, contrast(color, ground));
      return false;
    });
    EXPECT_GE(best, readableContrast) << qColor(face).name().toStdString();
  }
}

TEST(ButtonLook, DrawsTheSquareBezelToTheCorners) {
  QPushButton button("Next");
  button.resize(100, 30);
  const QColor rounded = pictureOf(button).pixelColor(0, 0);
  setBezel(button, BezelStyle::texturedSquare);
  const QColor square = pictureOf(button).pixelColor(0, 0);
  EXPECT_NE(rounded, square);
  EXPECT_EQ(square, pictureOf(button).pixelColor(50, 0)) << "the edge is as dark in the corner";
  const QImage picture = pictureOf(button);
  EXPECT_GE(contrast(Qt::black, picture.pixelColor(8, 15)), readableContrast);
}

TEST(ButtonLook, GivesTheHostItsFontBackWithAPlainTitle) {
  QPushButton button("x");
  const QFont font = button.font();
  showTitle(button, redTitle("Big", 40));
  showTitle(button, "small");
  EXPECT_EQ(button.font(), font);
  EXPECT_FALSE(button.testAttribute(Qt::WA_SetFont));
  EXPECT_TRUE(button.children().isEmpty());
}

}  // namespace

}  // namespace qz
