// SPDX-License-Identifier: MIT
// Turns pieces into fragments with a character format, and paragraphs into blocks with a block
// format.

#include "toolkit/qt/rich_text.hpp"

#include <QTextBlockFormat>
#include <QTextCharFormat>
#include <QTextCursor>
#include <QTextOption>
#include <algorithm>
#include <utility>

#include "toolkit/qt/fonts.hpp"
#include "toolkit/qt/rich_text_parts.hpp"
#include "toolkit/qt/strings.hpp"

namespace qz::toolkit::qt {

namespace {

QTextCharFormat formatOf(const TextAttributes& attributes, const TextSetting& setting) {
  QTextCharFormat format;
  if (attributes.font) {
    format.setFont(qFont(*attributes.font), QTextCharFormat::FontPropertiesSpecifiedOnly);
  }
  if (attributes.link) {
    format.setAnchor(true);
    format.setAnchorHref(qString(attributes.link->address()));
  }
  if (const auto ink = inkOf(attributes, setting)) format.setForeground(*ink);
  if (attributes.backgroundColor) format.setBackground(inkOf(*attributes.backgroundColor, setting));
  if (attributes.underline) format.setFontUnderline(true);
  if (attributes.strikethrough) format.setFontStrikeOut(true);
  if (attributes.superscript != 0) {
    format.setVerticalAlignment(attributes.superscript > 0 ? QTextCharFormat::AlignSuperScript
                                                           : QTextCharFormat::AlignSubScript);
  }
  return format;
}

/// Returns the tab stops of a list item; Qt's own are 80 points apart. Left and right are those of
/// the page.
QList<QTextOption::Tab> tabsFor(const MarkerStops& stops, Qt::LayoutDirection direction) {
  const bool leftwards = direction == Qt::RightToLeft;
  const auto begin = leftwards ? QTextOption::RightTab : QTextOption::LeftTab;
  const auto end = leftwards ? QTextOption::LeftTab : QTextOption::RightTab;
  return {QTextOption::Tab(stops.marker, end), QTextOption::Tab(stops.text, begin),
          QTextOption::Tab(2 * stops.text, begin)};  // after a wide marker
}

QTextBlockFormat blockFormatOf(const Paragraph& paragraph, const TextSetting& setting) {
  const BlockSetting block = blockSettingOf(*paragraph.attributes, setting);
  QTextBlockFormat format;
  format.setAlignment(block.alignment);
  format.setLayoutDirection(setting.direction);
  const Qt::LayoutDirection direction = directionOf(paragraph, setting);
  if (direction == Qt::RightToLeft) {
    format.setRightMargin(block.before);
  } else {
    format.setLeftMargin(block.before);
  }
  format.setTextIndent(block.firstLine);
  if (const auto stops = markerStopsOf(block)) format.setTabPositions(tabsFor(*stops, direction));
  return format;
}

}  // namespace

void showIn(QTextDocument& document, const AttributedString& text, const TextSetting& setting) {
  const bool undo = document.isUndoRedoEnabled();
  document.setUndoRedoEnabled(false);  // the user must not be able to undo what a script shows
  document.clear();
  document.setDefaultFont(setting.font);
  QTextOption option = document.defaultTextOption();
  option.setTextDirection(setting.direction);
  document.setDefaultTextOption(option);

  QTextCursor cursor(&document);
  bool first = true;
  for (const Paragraph& paragraph : paragraphsOf(text, setting.dropsLastLineEnd)) {
    if (!std::exchange(first, false)) cursor.insertBlock();
    cursor.setBlockFormat(blockFormatOf(paragraph, setting));
    cursor.setBlockCharFormat(formatOf(*paragraph.attributes, setting));
    for (const Piece& piece : paragraph.pieces) {
      cursor.insertText(piece.text, formatOf(*piece.attributes, setting));
    }
  }
  document.setUndoRedoEnabled(undo);
}

Qt::LayoutDirection writingDirectionOf(const AttributedString& text) {
  return qString(text.string()).isRightToLeft() ? Qt::RightToLeft : Qt::LeftToRight;
}

bool hasLinks(const AttributedString& text) {
  return std::any_of(text.runs().begin(), text.runs().end(),
                     [](const TextRun& run) { return run.attributes.link.has_value(); });
}

bool isPlain(const AttributedString& text) {
  return std::all_of(text.runs().begin(), text.runs().end(),
                     [](const TextRun& run) { return run.attributes == TextAttributes{}; });
}

TextAttributes commonAttributes(const AttributedString& text) {
  if (text.runs().empty()) return {};
  TextAttributes common = text.runs().front().attributes;
  const auto keepEqual = [](auto& mine, const auto& other) {
    if (mine != other) mine = {};
  };
  for (const TextRun& run : text.runs()) {
    keepEqual(common.font, run.attributes.font);
    keepEqual(common.foregroundColor, run.attributes.foregroundColor);
    keepEqual(common.backgroundColor, run.attributes.backgroundColor);
    keepEqual(common.paragraphStyle, run.attributes.paragraphStyle);
    keepEqual(common.link, run.attributes.link);
    keepEqual(common.underline, run.attributes.underline);
    keepEqual(common.strikethrough, run.attributes.strikethrough);
    keepEqual(common.superscript, run.attributes.superscript);
  }
  return common;
}

QFont largestFont(const AttributedString& text, const QFont& otherwise) {
  const Font* largest = nullptr;
  for (const TextRun& run : text.runs()) {
    const auto& font = run.attributes.font;
    if (font && (!largest || font->size > largest->size)) largest = &*font;
  }
  return largest ? qFont(*largest) : otherwise;
}

}  // namespace qz::toolkit::qt
