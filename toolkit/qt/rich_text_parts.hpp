// SPDX-License-Identifier: MIT
// Attributed strings taken apart, in the terms in which Qt's documents and its HTML are written.
#pragma once

#include <QColor>
#include <QString>
#include <optional>
#include <vector>

#include "toolkit/qt/rich_text.hpp"

namespace toolkit::qt {

/// Text of one style.
struct Piece {
  QString text;
  const TextAttributes* attributes;
};

/// A line of the text, with the attributes by which it is laid out: those of its first character,
/// and of an empty one those of the line end before it.
struct Paragraph {
  const TextAttributes* attributes;
  std::vector<Piece> pieces;
};

/// Takes `text` apart, which outlives the paragraphs.
std::vector<Paragraph> paragraphsOf(const AttributedString& text, bool dropsLastLineEnd);

/// The direction in which the paragraph is written, left to right or the other way.
Qt::LayoutDirection directionOf(const Paragraph& paragraph, const TextSetting& setting);

/// How a paragraph stands.
struct BlockSetting {
  Qt::Alignment alignment;
  double before;     ///< between the edge at which lines begin and the lines, in points
  double firstLine;  ///< what the first line stands further in than the others
};

BlockSetting blockSettingOf(const TextAttributes& attributes, const TextSetting& setting);

/// Where the marker of a list item ends and where its text begins, in points from the beginning of
/// a first line that hangs. Absent where lines do not hang, or too little.
struct MarkerStops {
  double marker;
  double text;
};
std::optional<MarkerStops> markerStopsOf(const BlockSetting& block);

/// What the text's own colour is drawn as.
QColor inkOf(const Color& color, const TextSetting& setting);
/// What text is drawn in; absent where the viewer has the choice.
std::optional<QColor> inkOf(const TextAttributes& attributes, const TextSetting& setting);

}  // namespace toolkit::qt
