// SPDX-License-Identifier: MIT
// Splits attributed strings into the parts of which Qt's documents and HTML consist.
#pragma once

#include <QColor>
#include <QString>
#include <optional>
#include <vector>

#include "toolkit/qt/rich_text.hpp"

namespace qz::toolkit::qt {

/// Text of one style.
struct Piece {
  QString text;
  const TextAttributes* attributes;
};

/// A line of the text, with the attributes that determine its layout: those of its first character
/// or, in an empty line, those of the line end before it.
struct Paragraph {
  const TextAttributes* attributes;
  std::vector<Piece> pieces;
};

/// Splits `text`, which must outlive the paragraphs.
std::vector<Paragraph> paragraphsOf(const AttributedString& text, bool dropsLastLineEnd);

/// Returns the writing direction of the paragraph.
Qt::LayoutDirection directionOf(const Paragraph& paragraph, const TextSetting& setting);

/// The layout of a paragraph.
struct BlockSetting {
  Qt::Alignment alignment;
  double before;     ///< from the edge where lines begin to the lines, in points
  double firstLine;  ///< extra indent of the first line, in points
};

BlockSetting blockSettingOf(const TextAttributes& attributes, const TextSetting& setting);

/// Where the marker of a list item ends and where its text begins, in points from the beginning of
/// a hanging first line. Absent if lines do not hang, or hang too little.
struct MarkerStops {
  double marker;
  double text;
};
std::optional<MarkerStops> markerStopsOf(const BlockSetting& block);

/// Returns the colour in which the text's own colour is drawn.
QColor inkOf(const Color& color, const TextSetting& setting);
/// Returns the colour in which text is drawn; absent if the viewer chooses.
std::optional<QColor> inkOf(const TextAttributes& attributes, const TextSetting& setting);

}  // namespace qz::toolkit::qt
