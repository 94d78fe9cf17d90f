// SPDX-License-Identifier: MIT
// Attributed strings as Qt's documents.
#pragma once

#include <QColor>
#include <QFont>
#include <QString>
#include <QTextDocument>
#include <optional>

#include "toolkit/styled_text/attributed_string.hpp"

namespace toolkit::qt {

/// What the attributed string leaves to whoever draws it.
struct TextSetting {
  QFont font;
  QColor link;    ///< of links that have no colour of their own
  QColor ground;  ///< what the text stands on
  /// Where paragraphs without a style stand.
  Qt::Alignment unasked = Qt::AlignLeading;
  /// Where paragraphs of natural alignment stand; leading, where their own writing begins.
  Qt::Alignment natural = Qt::AlignLeading;
  /// The writing direction; automatic, each paragraph's own text tells.
  Qt::LayoutDirection direction = Qt::LeftToRight;
  /// How text without a colour is drawn; not set, the document's viewer has the choice.
  std::optional<QColor> ink{};
  /// Colours of the text's own are drawn half as strong, as in disabled controls.
  bool greyed = false;
  /// A line end behind the last line is left out, so that it takes up no room.
  bool dropsLastLineEnd = true;
};

/// Makes `document` show `text`, in place of what it has.
void showIn(QTextDocument& document, const AttributedString& text, const TextSetting& setting);

/// The same as HTML, for widgets that take nothing else.
QString htmlOf(const AttributedString& text, const TextSetting& setting);

/// The direction in which Qt writes the plain text: that of its first letter that has one, wherever
/// the text stands.
Qt::LayoutDirection writingDirectionOf(const AttributedString& text);

/// Whether any of `text` is a link.
bool hasLinks(const AttributedString& text);

/// Whether `text` has no attributes at all, so that plain text shows all of it.
bool isPlain(const AttributedString& text);

/// What all of `text` has in common, of attributes: absent where its parts differ.
TextAttributes commonAttributes(const AttributedString& text);

/// The largest font in `text`, for whoever has room for one; `otherwise` where it names none.
QFont largestFont(const AttributedString& text, const QFont& otherwise);

}  // namespace toolkit::qt
