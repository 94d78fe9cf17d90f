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
  /// Where paragraphs without a style stand; those of natural alignment begin where lines begin.
  Qt::Alignment unasked = Qt::AlignLeading;
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

/// Whether any of `text` is a link.
bool hasLinks(const AttributedString& text);

/// Whether `text` has no attributes at all, so that plain text shows all of it.
bool isPlain(const AttributedString& text);

/// What all of `text` has in common, of attributes: absent where its parts differ.
TextAttributes commonAttributes(const AttributedString& text);

/// The largest font in `text`, for whoever has room for one; `otherwise` where it names none.
QFont largestFont(const AttributedString& text, const QFont& otherwise);

}  // namespace toolkit::qt
