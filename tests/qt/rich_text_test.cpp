// SPDX-License-Identifier: MIT
// Attributed strings as documents: every attribute is kept.

#include "toolkit/qt/rich_text.hpp"

#include <gtest/gtest.h>

#include <QTextBlock>
#include <QTextDocument>

#include "toolkit/qt/fonts.hpp"
#include "toolkit/qt/strings.hpp"

namespace qz {

namespace {

using namespace toolkit;
using namespace toolkit::qt;

TextSetting plainSetting() { return {QFont(), Qt::blue, Qt::white}; }

QTextCharFormat formatAt(const QTextDocument& document, int position) {
  QTextCursor cursor(const_cast<QTextDocument*>(&document));
  cursor.setPosition(position + 1);  // a cursor has the format of the character before it
  return cursor.charFormat();
}

QTextCharFormat formatOf(const TextAttributes& attributes, const TextSetting& setting) {
  QTextDocument document;
  showIn(document, AttributedString("x", attributes), setting);
  return formatAt(document, 0);
}

TEST(RichText, CarriesEveryAttributeOfCharacters) {
  const auto with = [](auto change) {
    TextAttributes attributes;
    change(attributes);
    return formatOf(attributes, plainSetting());
  };
  EXPECT_EQ(with([](auto& a) {
              a.font = Font{"Courier", 20, true, true, true};
            })
                .font()
                .pixelSize(),
            20);
  EXPECT_TRUE(with([](auto& a) { a.font = Font{"Times", 20, true}; }).font().bold());
  EXPECT_EQ(with([](auto& a) { a.foregroundColor = colors::red; }).foreground().color(),
            QColor(Qt::red));
  EXPECT_EQ(with([](auto& a) { a.backgroundColor = colors::green; }).background().color(),
            QColor(Qt::green));
  EXPECT_TRUE(with([](auto& a) { a.underline = true; }).fontUnderline());
  EXPECT_TRUE(with([](auto& a) { a.strikethrough = true; }).fontStrikeOut());
  EXPECT_EQ(with([](auto& a) { a.superscript = 1; }).verticalAlignment(),
            QTextCharFormat::AlignSuperScript);
  EXPECT_EQ(with([](auto& a) { a.superscript = -2; }).verticalAlignment(),
            QTextCharFormat::AlignSubScript);
  const QTextCharFormat link = with([](auto& a) { a.link = "x:y"; });
  EXPECT_EQ(link.anchorHref().toStdString(), "x:y");
  EXPECT_EQ(link.foreground().color(), QColor(Qt::blue));
}

TEST(RichText, GivesEachParagraphItsStyle) {
  struct Case {
    TextAlignment alignment;
    Qt::Alignment shown;
  };
  const Case cases[] = {
      {TextAlignment::left, Qt::AlignLeft | Qt::AlignAbsolute},
      {TextAlignment::right, Qt::AlignRight | Qt::AlignAbsolute},
      {TextAlignment::center, Qt::AlignHCenter},
      {TextAlignment::justified, Qt::AlignJustify},
      {TextAlignment::natural, Qt::AlignLeading},
  };
  AttributedString text;
  for (const Case& test : cases) {
    text.append("line\n", {.paragraphStyle = ParagraphStyle{test.alignment, 5, 12}});
  }
  QTextDocument document;
  showIn(document, text, plainSetting());
  ASSERT_EQ(document.blockCount(), 5);
  QTextBlock block = document.firstBlock();
  for (const Case& test : cases) {
    EXPECT_EQ(block.blockFormat().alignment(), test.shown) << block.blockNumber();
    EXPECT_EQ(block.blockFormat().leftMargin(), 12);
    EXPECT_EQ(block.blockFormat().textIndent(), -7);
    block = block.next();
  }
}

/// Returns the format of the word's first character.
QTextCharFormat formatOf(const char* word, const QTextDocument& document) {
  return formatAt(document, document.find(word).selectionStart());
}

TEST(RichText, IsTheSameByHtml) {
  AttributedString text("a <b> & \"c\"  two  blanks\n\n");
  text.append("bold", {.font = Font{"Times", 24, true, true}, .underline = true});
  text.append("red\u2028line", {.foregroundColor = Color{1, 0, 0, 0.5}, .strikethrough = true});
  text.append("\nlast", {.paragraphStyle = ParagraphStyle{TextAlignment::right, 5, 12},
                         .link = "x:y?a=1&b=2"});
  for (const auto direction : {Qt::LeftToRight, Qt::RightToLeft}) {
    TextSetting setting = plainSetting();
    setting.direction = direction;
    QTextDocument direct;
    showIn(direct, text, setting);
    QTextDocument byHtml;
    byHtml.setHtml(htmlOf(text, setting));
    EXPECT_EQ(byHtml.toPlainText(), direct.toPlainText());
    EXPECT_EQ(byHtml.size(), direct.size());
    EXPECT_EQ(byHtml.lastBlock().blockFormat().alignment(), Qt::AlignRight | Qt::AlignAbsolute);
    EXPECT_EQ(byHtml.lastBlock().blockFormat().textIndent(), -7);
    EXPECT_EQ(formatOf("last", byHtml).anchorHref(), "x:y?a=1&b=2");
    const QTextCharFormat bold = formatOf("bold", byHtml);
    EXPECT_EQ(bold.font().pixelSize(), 24);
    EXPECT_TRUE(bold.font().bold() && bold.font().italic() && bold.fontUnderline());
    const QTextCharFormat red = formatOf("red", byHtml);
    EXPECT_TRUE(red.fontStrikeOut());
    EXPECT_EQ(red.foreground().color().red(), 255);
    EXPECT_NEAR(red.foreground().color().alpha(), 128, 1);
  }
}

TEST(RichText, KeepsTheLastLineEndOnlyForEditing) {
  TextSetting setting = plainSetting();
  QTextDocument document;
  const AttributedString text("a\nb\n");
  showIn(document, text, setting);
  EXPECT_EQ(document.toPlainText().toStdString(), "a\nb");
  setting.dropsLastLineEnd = false;
  showIn(document, text, setting);
  EXPECT_EQ(document.toPlainText().toStdString(), "a\nb\n");
}

TEST(RichText, GreysColoursHalfwayToTheGround) {
  TextSetting setting = plainSetting();
  setting.greyed = true;
  const QColor grey = formatOf({.foregroundColor = colors::black}, setting).foreground().color();
  EXPECT_NEAR(grey.red(), 128, 1);
}

TEST(RichText, LeavesNothingToUndo) {
  QTextDocument document;
  showIn(document, AttributedString("text"), plainSetting());
  EXPECT_TRUE(document.isUndoRedoEnabled());
  EXPECT_FALSE(document.isUndoAvailable());
}

}  // namespace

}  // namespace qz
