// SPDX-License-Identifier: MIT
// Script changes are visible on every kind of button, however its host styles it.

#include <gtest/gtest.h>

#include <QCheckBox>
#include <QCommandLinkButton>
#include <QPushButton>
#include <QRadioButton>
#include <QStyle>
#include <QStyleFactory>
#include <QToolButton>
#include <cmath>
#include <memory>
#include <ostream>
#include <string>

#include "tests/qt/rendering.hpp"
#include "toolkit/qt/button_look.hpp"

namespace qz {

namespace {

using namespace toolkit;
using namespace toolkit::qt;
using namespace rendering;

/// A host's own button, which paints itself.
struct Dial : QAbstractButton {
  explicit Dial(const QString& text) { setText(text); }
  void paintEvent(QPaintEvent*) override {
    QPainter painter(this);
    painter.fillRect(rect(), isChecked() ? Qt::darkGray : Qt::lightGray);
    painter.drawText(rect(), Qt::AlignCenter, text());
  }
};

template <class B>
QAbstractButton* make() {
  return new B("Title");
}

template <>
QAbstractButton* make<QToolButton>() {
  auto* const button = new QToolButton;
  button->setText("Title");
  return button;
}

struct ButtonKind {
  const char* name;
  QAbstractButton* (*make)();
};

void PrintTo(const ButtonKind& kind, std::ostream* out) { *out << kind.name; }

const ButtonKind buttonKinds[] = {
    {"push", make<QPushButton>},   {"tool", make<QToolButton>},        {"check", make<QCheckBox>},
    {"radio", make<QRadioButton>}, {"link", make<QCommandLinkButton>}, {"foreign", make<Dial>},
};

const char* const sheets[] = {
    "",
    "QAbstractButton { border: 1px solid #888; border-radius: 4px; background: #eee; }",
    "QAbstractButton { background: #222; color: #ddd; border: none; padding: 4px; }",
    ("QAbstractButton { background: #3b82f6; color: white; border: 2px solid #1d4ed8; }"
     "QAbstractButton:hover { background: #60a5fa; }"),
    "* { font-size: 13px; color: #eee; background-color: #333; }",
};

QPalette darkPalette() {
  QPalette palette(QColor(53, 53, 53));
  for (const auto role : {QPalette::WindowText, QPalette::ButtonText, QPalette::Text}) {
    palette.setColor(role, Qt::white);
  }
  return palette;
}

struct Dress {
  std::string style;
  QString sheet;
  bool dark = false;
};

struct DressedButton {
  std::unique_ptr<QStyle> style;
  std::unique_ptr<QAbstractButton> button;

  DressedButton(const ButtonKind& kind, const Dress& dress)
      : style(QStyleFactory::create(QString::fromStdString(dress.style))), button(kind.make()) {
    if (dress.dark) button->setPalette(darkPalette());
    button->setStyle(style.get());
    button->setStyleSheet(dress.sheet);
    button->resize(160, 40);
  }
};

enum class Press { off, on, mixed };

void setPress(QAbstractButton& button, Press press) {
  button.setAutoExclusive(false);
  button.setCheckable(true);
  auto* const box = qobject_cast<QCheckBox*>(&button);
  if (press == Press::mixed && box) return box->setCheckState(Qt::PartiallyChecked);
  button.setChecked(press != Press::off);
}

/// Approximates WCAG's relative luminance.
double luminance(QRgb pixel) {
  const auto linear = [](int channel) { return std::pow(channel / 255.0, 2.2); };
  return 0.2126 * linear(qRed(pixel)) + 0.7152 * linear(qGreen(pixel)) +
         0.0722 * linear(qBlue(pixel));
}

/// Returns the share of pixels whose luminance changes by at least a seventh of its range.
double shareOfNoticed(const QImage& before, const QImage& after) {
  int noticed = 0;
  for (int y = 0; y < before.height(); ++y) {
    for (int x = 0; x < before.width(); ++x) {
      if (std::abs(luminance(before.pixel(x, y)) - luminance(after.pixel(x, y))) >= 1.0 / 7) {
        ++noticed;
      }
    }
  }
  return noticed / static_cast<double>(before.width() * before.height());
}

void expectEachShows(QAbstractButton& button) {
  const QImage before = pictureOf(button);
  const auto properties = button.dynamicPropertyNames();  // style sheets set some
  setHighlighted(button, true);
  EXPECT_GE(shareOfNoticed(before, pictureOf(button)), 0.1) << "highlight";
  setHighlighted(button, false);
  EXPECT_EQ(pictureOf(button), before) << "highlight taken back";

  const int reddish = countPixels(before, isReddish);
  setFaceColor(button, colors::red);
  EXPECT_GT(countPixels(pictureOf(button), isReddish), reddish + 400) << "background";
  setHighlighted(button, true);
  EXPECT_NE(pictureOf(button), before) << "both";
  setHighlighted(button, false);
  setFaceColor(button, std::nullopt);
  EXPECT_EQ(pictureOf(button), before) << "background taken back";

  showTitle(button, AttributedString("Title", {.foregroundColor = colors::red}));
  EXPECT_NE(pictureOf(button), before) << "title";
  // A disabled title is mixed with its background and may not be red any more.
  const int seen = button.isEnabled() ? reddish + 20 : -1;
  EXPECT_GT(countPixels(pictureOf(button), isReddish), seen) << "title";
  showTitle(button, "Title");
  EXPECT_EQ(pictureOf(button), before) << "title taken back";
  EXPECT_EQ(button.dynamicPropertyNames(), properties);
}

class ButtonPixels : public testing::TestWithParam<ButtonKind> {};

TEST_P(ButtonPixels, ShowTheHighlightTheBackgroundAndTheTitlesColour) {
  for (const char* const style : {"Fusion", "Windows"}) {
    for (const char* const sheet : sheets) {
      for (const Press press : {Press::off, Press::on, Press::mixed}) {
        for (const bool enabled : {true, false}) {
          SCOPED_TRACE(std::string(style) + ", " + sheet + ", " +
                       std::to_string(static_cast<int>(press)) + (enabled ? "" : ", disabled"));
          const DressedButton dressed(GetParam(), {style, sheet});
          setPress(*dressed.button, press);
          dressed.button->setEnabled(enabled);
          expectEachShows(*dressed.button);
        }
      }
    }
  }
}

TEST_P(ButtonPixels, ShowTheHighlightOnDarkGroundAndInEverySize) {
  for (const QSize size : {QSize(24, 24), QSize(80, 24), QSize(200, 40), QSize(120, 120)}) {
    for (const bool dark : {false, true}) {
      SCOPED_TRACE(std::to_string(size.width()) + (dark ? " dark" : ""));
      const DressedButton dressed(GetParam(), {"Fusion", "", dark});
      dressed.button->resize(size);
      const QImage before = pictureOf(*dressed.button);
      setHighlighted(*dressed.button, true);
      EXPECT_GE(shareOfNoticed(before, pictureOf(*dressed.button)), 0.1);
    }
  }
}

INSTANTIATE_TEST_SUITE_P(Qt, ButtonPixels, testing::ValuesIn(buttonKinds),
                         [](const auto& test) { return test.param.name; });

}  // namespace

}  // namespace qz
