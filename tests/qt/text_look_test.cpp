// SPDX-License-Identifier: MIT
// What labels and edits show.

#include "toolkit/qt/text_look.hpp"

#include <gtest/gtest.h>

#include <QLabel>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QTextBlock>
#include <QTextEdit>
#include <memory>
#include <vector>

#include "tests/qt/rendering.hpp"

namespace qz {

namespace {

using namespace toolkit;
using namespace toolkit::qt;
using namespace rendering;

AttributedString redText(const std::string& text = "Some text") {
  return AttributedString(text, {.font = Font{"Helvetica", 18}, .foregroundColor = colors::red});
}

std::vector<std::unique_ptr<QWidget>> everyTextKind() {
  std::vector<std::unique_ptr<QWidget>> widgets;
  widgets.push_back(std::make_unique<QLabel>());
  widgets.push_back(std::make_unique<QLineEdit>());
  widgets.push_back(std::make_unique<QTextEdit>());
  widgets.push_back(std::make_unique<QPlainTextEdit>());
  for (const auto& widget : widgets) widget->resize(200, 60);
  return widgets;
}

TEST(TextLook, ReadsBackTheVeryTextThatWasShown) {
  for (const auto& widget : everyTextKind()) {
    SCOPED_TRACE(widget->metaObject()->className());
    for (const char* plain : {"", "a & b", "<b>no tag</b>", "&amp;", "Größe"}) {
      showText(*widget, plain);
      EXPECT_EQ(shownText(*widget), AttributedString(plain));
    }
    showText(*widget, redText("two\nlines\n"));
    EXPECT_EQ(shownText(*widget), redText("two\nlines\n"));
    showText(*widget, "plain again");
    EXPECT_EQ(shownText(*widget), AttributedString("plain again"));
  }
}

TEST(TextLook, KnowsWhenTheHostHasChangedTheText) {
  QLabel label;
  showText(label, redText());
  label.setText("<i>the host's</i>");
  EXPECT_EQ(shownText(label), AttributedString("the host's"));
  QLineEdit line;
  showText(line, redText());
  line.insert("!");
  EXPECT_EQ(shownText(line), AttributedString("Some text!"));
  QTextEdit edit;
  showText(edit, redText());
  edit.append("more");
  EXPECT_EQ(shownText(edit), AttributedString("Some text\nmore"));
}

TEST(TextLook, DrawsColoursEverywhere) {
  for (const auto& widget : everyTextKind()) {
    SCOPED_TRACE(widget->metaObject()->className());
    showText(*widget, redText());
    const int once = countPixels(pictureOf(*widget), isReddish);
    EXPECT_GT(once, 50);
    EXPECT_GT(countPixels(pictureOf(*widget, 2), isReddish), 2.5 * once);
    showText(*widget, "plain");
    EXPECT_EQ(countPixels(pictureOf(*widget), isReddish), 0) << "in the widget's own colour";
  }
}

TEST(TextLook, ShowsTagsOfPlainTextAsTheyAre) {
  QLabel tagged;
  showText(tagged, "<b>x</b>");
  QLabel plain;
  plain.setTextFormat(Qt::PlainText);
  plain.setText("<b>x</b>");
  tagged.resize(100, 20);
  plain.resize(100, 20);
  EXPECT_EQ(pictureOf(tagged), pictureOf(plain));
}

TEST(TextLook, LeavesTheWayALabelReadsItsTextAloneUnlessItMatters) {
  QLabel label;
  showText(label, "plain");
  showText(label, redText());
  showText(label, "plain again, after HTML");
  EXPECT_EQ(label.textFormat(), Qt::AutoText);
}

TEST(TextLook, GreysTextOfDisabledWidgetsAndBack) {
  for (const auto& widget : everyTextKind()) {
    SCOPED_TRACE(widget->metaObject()->className());
    showText(*widget, redText());
    const auto isPureRed = [](const QColor& color) {
      return color.red() > 230 && color.green() < 40 && color.blue() < 40;
    };
    EXPECT_GT(countPixels(pictureOf(*widget), isPureRed), 0);
    widget->setEnabled(false);
    EXPECT_EQ(countPixels(pictureOf(*widget), isPureRed), 0);
    EXPECT_EQ(shownText(*widget), redText());
    widget->setEnabled(true);
    EXPECT_GT(countPixels(pictureOf(*widget), isPureRed), 0);
  }
}

TEST(TextLook, OpensLinksOnlyThroughTheHost) {
  QLabel label;
  showText(label, AttributedString("link", {.link = "x:y"}));
  EXPECT_FALSE(label.openExternalLinks());
  EXPECT_TRUE(label.textInteractionFlags() & Qt::LinksAccessibleByMouse);
  EXPECT_TRUE(label.text().contains("href=\"x:y\""));
}

TEST(TextLook, MirrorsNaturalTextOnlyAndByItsLetters) {
  const auto leftEdge = [](const char* letters, TextAlignment alignment) {
    QLabel label;
    label.resize(300, 30);
    label.setLayoutDirection(Qt::RightToLeft);
    AttributedString text = redText(letters);
    text.addParagraphStyle(ParagraphStyle{.alignment = alignment}, {0, text.length()});
    showText(label, text);
    return boundsOf(pictureOf(label), isReddish).left();
  };
  EXPECT_LT(leftEdge("words", TextAlignment::natural), 20);
  EXPECT_GT(leftEdge("\u05e9\u05dc\u05d5\u05dd", TextAlignment::natural), 150);
  EXPECT_LT(leftEdge("\u05e9\u05dc\u05d5\u05dd", TextAlignment::left), 20);
  EXPECT_GT(leftEdge("words", TextAlignment::right), 150);
}

TEST(TextLook, LeavesNothingOnTheWidgetWithPlainText) {
  for (const auto& widget : everyTextKind()) {
    SCOPED_TRACE(widget->metaObject()->className());
    const auto children = widget->children().size();
    showText(*widget, redText());
    EXPECT_GT(widget->children().size(), children);
    showText(*widget, "plain");
    EXPECT_EQ(widget->children().size(), children);
    EXPECT_TRUE(widget->dynamicPropertyNames().isEmpty());
  }
}

}  // namespace

}  // namespace qz
