// SPDX-License-Identifier: MIT
// What labels, line edits and text edits show.
#pragma once

#include <string_view>

#include "toolkit/styled_text/attributed_string.hpp"

class QLabel;
class QWidget;

namespace toolkit::qt {

/// Whether text can be shown in `widget`: a label, a line edit, a text edit, a plain text edit.
bool showsText(const QWidget& widget);

/// Shows plain text, in the widget's own font and colour, as it is: neither tags nor ampersands
/// mean anything. Nothing happens to a widget that shows no text.
void showText(QWidget& widget, std::string_view text);
/// Shows text with its attributes; of a line edit, only the font, colour and alignment that all of
/// it has, and of paragraph styles a plain text edit shows only such an alignment. Links of labels
/// open only through the host (`QLabel::linkActivated`).
void showText(QWidget& widget, const AttributedString& text);
/// The very text that was shown last; without attributes where the host or the user has changed it
/// since. Empty of a widget that shows none.
AttributedString shownText(const QWidget& widget);

/// Makes a new label lay its text out as an AppKit text field: from the top, in several lines.
void layOutAsTextField(QLabel& label);

}  // namespace toolkit::qt
