// SPDX-License-Identifier: MIT
// Edits with a single style show the attributes that all of their text shares.

#include "toolkit/qt/edit_dress.hpp"

#include <gtest/gtest.h>

#include <QLineEdit>
#include <QPlainTextEdit>
#include <QTextEdit>

#include "tests/qt/rendering.hpp"
#include "toolkit/qt/text_look.hpp"

namespace qz {

namespace {

using namespace toolkit;
using namespace toolkit::qt;
using namespace rendering;

AttributedString centredRed() {
  return AttributedString("Text", {.font = Font{"Times", 20, true},
                                   .foregroundColor = colors::red,
                                   .paragraphStyle = ParagraphStyle{TextAlignment::center}});
}

TEST(EditDress, ShowsFontColourAndAlignmentInALineEditAndTakesThemBack) {
  QLineEdit edit("Text");
  edit.resize(300, 40);
  const QImage before = pictureOf(edit);
  showText(edit, centredRed());
  const QRect shown = boundsOf(pictureOf(edit), isReddish);
  EXPECT_NEAR(shown.center().x(), 150, 6);
  EXPECT_GT(shown.height(), 11);
  EXPECT_EQ(edit.font().pixelSize(), 20);
  EXPECT_TRUE(edit.alignment() & Qt::AlignVCenter);
  showText(edit, "Text");
  EXPECT_EQ(pictureOf(edit), before);
  EXPECT_FALSE(edit.testAttribute(Qt::WA_SetFont));
  EXPECT_FALSE(edit.testAttribute(Qt::WA_SetPalette));
}

TEST(EditDress, LeavesOutWhatOnlyPartsOfTheTextHave) {
  QLineEdit edit;
  edit.resize(300, 40);
  AttributedString text("red ", {.foregroundColor = colors::red});
  text.append("and not", {});
  showText(edit, text);
  EXPECT_EQ(countPixels(pictureOf(edit), isReddish), 0);
}

TEST(EditDress, AlignsAPlainTextEditAndTakesThatBack) {
  QPlainTextEdit edit;
  edit.resize(300, 60);
  showText(edit, "Text");
  const QImage before = pictureOf(edit);
  showText(edit, centredRed());
  EXPECT_NEAR(boundsOf(pictureOf(edit), isReddish).center().x(), 150, 6);
  showText(edit, "Text");
  EXPECT_EQ(pictureOf(edit), before);
}

TEST(EditDress, BeginsJustifiedTextOfALineWhereItsLettersBegin) {
  QLineEdit edit;
  edit.resize(300, 40);
  AttributedString text("\u05e9\u05dc\u05d5\u05dd", {.foregroundColor = colors::red});
  text.addParagraphStyle(ParagraphStyle{TextAlignment::justified}, {0, text.length()});
  showText(edit, text);
  EXPECT_GT(boundsOf(pictureOf(edit), isReddish).left(), 200);
}

TEST(EditDress, GivesBackWhatTheHostHasSet) {
  QLineEdit edit("Text");
  edit.setFont(QFont("Liberation Serif", 17));
  edit.setAlignment(Qt::AlignRight | Qt::AlignTop);
  QPalette green;
  green.setColor(QPalette::Text, Qt::darkGreen);
  edit.setPalette(green);
  edit.resize(300, 40);
  const QImage before = pictureOf(edit);
  showText(edit, centredRed());
  showText(edit, centredRed());
  showText(edit, "Text");
  EXPECT_EQ(pictureOf(edit), before);
}

TEST(EditText, EndsALineAtEachCellOfATable) {
  QTextEdit edit;
  edit.setHtml("before<table><tr><td>a</td><td>b</td></tr></table>behind");
  EXPECT_EQ(shownText(edit).string(), edit.toPlainText().toStdString());
}

TEST(EditText, KeepsNoBreakBlanks) {
  QTextEdit edit;
  QPlainTextEdit plain;
  const AttributedString text("10\u00a0km\nand more");
  for (QWidget* const widget : {static_cast<QWidget*>(&edit), static_cast<QWidget*>(&plain)}) {
    showText(*widget, text.string());
    EXPECT_EQ(shownText(*widget), text);
  }
}

}  // namespace

}  // namespace qz
