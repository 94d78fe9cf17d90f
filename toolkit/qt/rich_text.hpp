// SPDX-License-Identifier: MIT
// Shows attributed strings as Qt documents.
#pragma once

#include <QColor>
#include <QFont>
#include <QString>
#include <QTextDocument>
#include <optional>

#include "qz/styled_text/attributed_string.hpp"

namespace qz::toolkit::qt {

/// The settings that an attributed string leaves to the widget that draws it.
struct TextSetting {
  QFont font;
  QColor link;    ///< for links without a colour
  QColor ground;  ///< the background
  /// The alignment of paragraphs without a style.
  Qt::Alignment unasked = Qt::AlignLeading;
  /// The alignment of paragraphs with natural alignment; leading: the edge where their writing
  /// direction begins.
  Qt::Alignment natural = Qt::AlignLeading;
  /// The writing direction; automatic: each paragraph's text decides.
  Qt::LayoutDirection direction = Qt::LeftToRight;
  /// The colour of text without one; absent: the document's viewer chooses.
  std::optional<QColor> ink{};
  /// Draws the text's own colours half as strong, as in disabled controls.
  bool greyed = false;
  /// Leaves out a line end after the last line, so that it takes up no space.
  bool dropsLastLineEnd = true;
};

/// Replaces the document's content with `text`.
void showIn(QTextDocument& document, const AttributedString& text, const TextSetting& setting);

/// Returns the same as HTML, for widgets that accept nothing else.
QString htmlOf(const AttributedString& text, const TextSetting& setting);

/// Returns the direction in which Qt writes the plain text: that of the first letter that has a
/// direction, whatever the alignment.
Qt::LayoutDirection writingDirectionOf(const AttributedString& text);

/// True if any part of `text` is a link.
bool hasLinks(const AttributedString& text);

/// True if `text` has no attributes, so that plain text shows all of it.
bool isPlain(const AttributedString& text);

/// Returns the attributes that all of `text` shares; an attribute that differs between parts is
/// absent.
TextAttributes commonAttributes(const AttributedString& text);

/// Returns the largest font in `text`, for widgets with only one font; `otherwise` if it names
/// none.
QFont largestFont(const AttributedString& text, const QFont& otherwise);

}  // namespace qz::toolkit::qt
