// SPDX-License-Identifier: MIT
// What labels, line edits and text edits show.
#pragma once

#include <optional>
#include <string_view>

#include "qz/styled_text/attributed_string.hpp"

class QLabel;
class QWidget;

namespace qz::toolkit::qt {

/// True if `widget` can show text: a label, a line edit, a text edit or a plain text edit.
bool showsText(const QWidget& widget);

/// Shows plain text literally, in the widget's own font and colour; tags and ampersands have no
/// meaning. Does nothing for a widget that shows no text.
void showText(QWidget& widget, std::string_view text);
/// Shows text with its attributes. A line edit shows only the font, colour and alignment that the
/// whole text shares; a plain text edit only such an alignment of its paragraph styles. Links in
/// labels open only through the host (`QLabel::linkActivated`).
void showText(QWidget& widget, const AttributedString& text);
/// Returns the text that was shown last, with its attributes; if the host or the user has changed
/// it since, the new text without attributes. Empty for a widget that shows none.
AttributedString shownText(const QWidget& widget);

/// Returns the text with attributes that was shown last, even if the host or the user has changed
/// the widget's text since; absent if it was plain.
std::optional<AttributedString> styledText(const QWidget& widget);
/// Takes the attributes off the widget. The words stay.
void dropStyledText(QWidget& widget);

/// Makes a new label lay out its text like an AppKit text field: from the top, in several lines.
void layOutAsTextField(QLabel& label);

}  // namespace qz::toolkit::qt
