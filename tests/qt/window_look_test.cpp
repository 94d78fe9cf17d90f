// SPDX-License-Identifier: MIT
// Windows of any colour stay readable as drawn, not only by their palettes.

#include "toolkit/qt/window_look.hpp"

#include <gtest/gtest.h>

#include <QCheckBox>
#include <QLabel>
#include <QRadioButton>
#include <QVBoxLayout>
#include <algorithm>

#include "tests/qt/rendering.hpp"
#include "toolkit/qt/contrast.hpp"
#include "toolkit/qt/strings.hpp"
#include "toolkit/qt/text_look.hpp"

namespace qz {

namespace {

using namespace toolkit;
using namespace toolkit::qt;
using namespace rendering;

double bestContrast(QWidget& widget, const QColor& ground) {
  double best = 1;
  // The style decides the look of the box itself, so only the text to its right counts.
  const QImage picture = pictureOf(*widget.window());
  const QRect area(widget.mapTo(widget.window(), QPoint(30, 0)), widget.size() - QSize(30, 0));
  countPixels(picture, area, [&](const QColor& color) {
    best = std::max(best, contrast(color, ground));
    return false;
  });
  return best;
}

TEST(WindowLook, GivesDefaultTextEnoughContrast) {
  for (const Color color : {colors::black, colors::white, colors::red, colors::blue, colors::gray,
                            colors::green, colors::orange}) {
    SCOPED_TRACE(qColor(color).name().toStdString());
    QWidget window;
    QVBoxLayout layout(&window);
    const QString text = "MMMMMMMM MMMM";
    QLabel plain(text);
    QLabel rich;
    QLabel link;
    QCheckBox box(text);
    QRadioButton radio(text);
    for (QWidget* const widget :
         {static_cast<QWidget*>(&plain), static_cast<QWidget*>(&rich), static_cast<QWidget*>(&link),
          static_cast<QWidget*>(&box), static_cast<QWidget*>(&radio)}) {
      layout.addWidget(widget);
    }
    showText(rich, AttributedString(utf8(text), {.font = Font{"Times", 16, true}}));
    showText(link, AttributedString(utf8(text), {.link = "x:y"}));
    window.resize(300, 200);
    setWindowColor(window, color);
    EXPECT_EQ(pictureOf(window).pixelColor(1, 1).rgb(), qColor(color).rgb());
    for (QWidget* const widget : window.findChildren<QWidget*>()) {
      EXPECT_GE(bestContrast(*widget, qColor(color)), readableContrast)
          << widget->metaObject()->className();
    }
  }
}

TEST(WindowLook, ReadsTheColourBack) {
  QWidget window;
  setWindowColor(window, colors::red);
  EXPECT_EQ(windowColor(window), colors::red);
}

}  // namespace

}  // namespace qz
