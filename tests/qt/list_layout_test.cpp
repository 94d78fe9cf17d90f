// SPDX-License-Identifier: MIT
// Lists of styled text: each level is indented further, and its lines hang.

#include <gtest/gtest.h>

#include <QLabel>
#include <QTextEdit>
#include <string>
#include <vector>

#include "tests/qt/rendering.hpp"
#include "toolkit/qt/text_look.hpp"

namespace qz {

namespace {

using namespace toolkit;
using namespace toolkit::qt;

const char* const latin = "words that go on, so many of them that they need two lines";
const char* const hebrew =
    "\u05e9\u05dc\u05d5\u05dd \u05e2\u05d5\u05dc\u05dd \u05e9\u05dc\u05d5\u05dd "
    "\u05e2\u05d5\u05dc\u05dd "
    "\u05e9\u05dc\u05d5\u05dd \u05e2\u05d5\u05dc\u05dd \u05e9\u05dc\u05d5\u05dd "
    "\u05e2\u05d5\u05dc\u05dd "
    "\u05e9\u05dc\u05d5\u05dd \u05e2\u05d5\u05dc\u05dd";

AttributedString itemsOfTwoLevels(const std::string& words) {
  const auto at = [](double indent) {
    return TextAttributes{
        .font = Font{"Helvetica", 14},
        .paragraphStyle = ParagraphStyle{.firstLineHeadIndent = indent - 36, .headIndent = indent}};
  };
  AttributedString text("\t\u2022\t" + words + "\n", at(36));
  text.append("\t\u25e6\t" + words, at(72));
  return text;
}

/// True for faint ink too, as in a small circle, which is all edge.
bool isInked(const QColor& color) { return color.lightness() < 210; }

/// The start of a drawn line, and the start of the text behind its first gap.
struct DrawnLine {
  int left;
  int behindGap;
};

int firstDark(const QImage& band, int from) {
  for (int x = from; x < band.width(); ++x) {
    if (rendering::countPixels(band, QRect(x, 0, 1, band.height()), isInked) > 0) return x;
  }
  return band.width();
}

DrawnLine lineIn(const QImage& band) {
  constexpr int gap = 5;  // wider than the gaps between letters
  const int left = firstDark(band, 0);
  int last = left;
  for (int x = firstDark(band, left); x <= last + gap && x < band.width();
       x = firstDark(band, x + 1)) {
    last = x;
  }
  return {left, firstDark(band, last + 1)};
}

std::vector<DrawnLine> linesIn(const QImage& picture) {
  std::vector<DrawnLine> lines;
  for (int y = 0, begin = -1; y < picture.height(); ++y) {
    const bool blank =
        rendering::countPixels(picture, QRect(0, y, picture.width(), 1), isInked) == 0;
    if (!blank && begin < 0) begin = y;
    if (!blank || begin < 0) continue;
    if (y - begin > 5) lines.push_back(lineIn(picture.copy(0, begin, picture.width(), y - begin)));
    begin = -1;
  }
  return lines;
}

void expectHangingLines(QWidget& widget, int edge, const char* words) {
  SCOPED_TRACE(std::string(widget.metaObject()->className()) + ", " + words);
  widget.resize(320, 160);
  showText(widget, itemsOfTwoLevels(words));
  QImage picture = rendering::pictureOf(widget);
  if (words == hebrew) picture = picture.mirrored(true, false);
  const auto lines = linesIn(picture);
  ASSERT_EQ(lines.size(), 4U);
  for (const std::size_t level : {0U, 1U}) {
    const int begin = edge + 36 * static_cast<int>(level);
    const DrawnLine& first = lines[2 * level];
    EXPECT_GE(first.left, begin + 10) << "the marker of level " << level;
    EXPECT_LT(first.left, begin + 30);
    EXPECT_NEAR(first.behindGap, begin + 36, 3) << "the text of level " << level;
    EXPECT_NEAR(lines[2 * level + 1].left, begin + 36, 3) << "wrapped";
  }
}

TEST(ListLayout, IndentsEachLevelAndHangsItsLines) {
  for (const char* const words : {latin, hebrew}) {
    QLabel label;
    label.setWordWrap(true);
    expectHangingLines(label, 0, words);
    QLabel selectable;  // draws the text itself
    selectable.setWordWrap(true);
    selectable.setTextInteractionFlags(Qt::TextSelectableByMouse);
    expectHangingLines(selectable, 0, words);
    QTextEdit edit;
    edit.setFrameShape(QFrame::NoFrame);
    expectHangingLines(edit, 4, words);
  }
}

TEST(ListLayout, PlacesTextBehindAMarkerTooWideForItsPlace) {
  AttributedString text("\txviii.\twords", {.font = Font{"Helvetica", 24},
                                            .paragraphStyle = ParagraphStyle{.headIndent = 36}});
  for (const bool selectable : {false, true}) {
    QLabel label;
    if (selectable) label.setTextInteractionFlags(Qt::TextSelectableByMouse);
    label.resize(320, 60);
    showText(label, text);
    const auto lines = linesIn(rendering::pictureOf(label));
    ASSERT_EQ(lines.size(), 1U);
    EXPECT_LT(lines[0].left, 5);
    EXPECT_NEAR(lines[0].behindGap, 72, 3);
  }
}

}  // namespace

}  // namespace qz
