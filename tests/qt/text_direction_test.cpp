// SPDX-License-Identifier: MIT
// Styled text is placed like plain text, in both layout directions.

#include <gtest/gtest.h>

#include <QCheckBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QTextEdit>
#include <memory>
#include <optional>

#include "tests/qt/rendering.hpp"
#include "toolkit/qt/button_look.hpp"
#include "toolkit/qt/text_look.hpp"

namespace qz {

namespace {

using namespace toolkit;
using namespace toolkit::qt;
using namespace rendering;

constexpr const char* latinWords = "Latin words.";
constexpr const char* hebrewWord = "\u05e9\u05dc\u05d5\u05dd.";
constexpr const char* arabicWord = "\u0633\u0644\u0627\u0645.";

bool isInk(const QColor& color) { return color.lightness() < 160; }

template <class Text>
QImage pictureWith(QWidget& widget, const Text& text) {
  widget.resize(300, 60);
  auto* const button = qobject_cast<QAbstractButton*>(&widget);
  button ? showTitle(*button, text) : showText(widget, text);
  return pictureOf(widget);
}

/// Expects `text` to look the same plain and styled, in black and the widget's own font.
void expectSamePicture(QWidget& widget, const std::string& text,
                       const std::optional<ParagraphStyle>& style = {}) {
  SCOPED_TRACE(std::string(widget.metaObject()->className()) + ", " + text +
               (widget.isRightToLeft() ? ", mirrored" : "") + (style ? ", natural" : ""));
  const QImage plain = pictureWith(widget, text);
  const QRect place = boundsOf(plain, isInk);
  const QImage dressed = pictureWith(
      widget, AttributedString(text, {.foregroundColor = colors::black, .paragraphStyle = style}));
  const QRect dressedPlace = boundsOf(dressed, isInk);
  EXPECT_NEAR(dressedPlace.left(), place.left(), 1);
  EXPECT_EQ(dressed.copy(dressedPlace), plain.copy(place)) << "the full stop too";
}

TEST(TextDirection, IsThatOfTheTextInBothLayouts) {
  QLabel label;
  QLabel selectable;
  selectable.setTextInteractionFlags(Qt::TextSelectableByMouse);
  QLineEdit line;
  QCheckBox box;
  for (QWidget* const widget : {static_cast<QWidget*>(&label), static_cast<QWidget*>(&selectable),
                                static_cast<QWidget*>(&line), static_cast<QWidget*>(&box)}) {
    for (const auto direction : {Qt::LeftToRight, Qt::RightToLeft}) {
      for (const char* const text : {latinWords, hebrewWord, arabicWord}) {
        widget->setLayoutDirection(direction);
        expectSamePicture(*widget, text);
        expectSamePicture(*widget, text, ParagraphStyle{});
      }
    }
  }
}

TEST(TextDirection, OfAPushButtonsTitleIsThatOfTheText) {
  QPushButton button;
  for (const auto direction : {Qt::LeftToRight, Qt::RightToLeft}) {
    for (const char* const text : {latinWords, hebrewWord, arabicWord}) {
      button.setLayoutDirection(direction);
      expectSamePicture(button, text);
    }
  }
}

TEST(TextDirection, IsThatOfEachParagraphInAnEdit) {
  for (const auto direction : {Qt::LeftToRight, Qt::RightToLeft}) {
    QTextEdit edit;
    edit.setFrameShape(QFrame::NoFrame);
    edit.setLayoutDirection(direction);
    expectSamePicture(edit, std::string(latinWords) + "\n" + hebrewWord);
  }
}

TEST(TextDirection, LeavesExplicitAlignmentsAlone) {
  for (const auto direction : {Qt::LeftToRight, Qt::RightToLeft}) {
    for (const char* const text : {latinWords, hebrewWord, arabicWord}) {
      for (const TextAlignment alignment : {TextAlignment::left, TextAlignment::right}) {
        SCOPED_TRACE(text);
        QLabel label;
        label.setLayoutDirection(direction);
        const QImage picture = pictureWith(
            label, AttributedString(text, {.foregroundColor = colors::black,
                                           .paragraphStyle = ParagraphStyle{alignment}}));
        const QRect place = boundsOf(picture, isInk);
        EXPECT_EQ(place.center().x() < 150, alignment == TextAlignment::left);
      }
    }
  }
}

}  // namespace

}  // namespace qz
