// SPDX-License-Identifier: MIT
// What buttons show: titles with attributes, the pressed-in look, colours and bezels.
//
// The widget's own style draws push buttons, check boxes, radio buttons and tool buttons; this code
// draws only what the style does not support: the title's attributes, the colour, the square bezel.
// Buttons of other classes draw themselves: the widget gets the font and the colour that the whole
// title shares, and the face colour is laid over its drawing. A highlight adds a dark frame and a
// light frame, because styles and style sheets may draw both states alike. `QAbstractButton::down`
// is left to the user: if a flash reset it while they hold the button down, Qt would drop their
// click.
#pragma once

#include <optional>
#include <string_view>

#include "qz/styled_text/attributed_string.hpp"
#include "qz/toolkit/view.hpp"

class QAbstractButton;
class QString;

namespace qz::toolkit::qt {

/// Shows a plain title in the button's own font and colour. Ampersands show as they are; they make
/// no mnemonics.
void showTitle(QAbstractButton& button, std::string_view title);
void showTitle(QAbstractButton& button, const AttributedString& title);
/// Returns the title that was shown last, with its attributes; if the host has set another since,
/// that one without attributes. Mnemonic markers of a host's title are left out.
AttributedString shownTitle(const QAbstractButton& button);

/// Returns the title with attributes that was shown last; absent if it was plain.
std::optional<AttributedString> styledTitle(const QAbstractButton& button);
/// Shows a text of the host, with its mnemonic.
void restoreTitle(QAbstractButton& button, const QString& text);

/// Shows or removes the pressed-in look. If the user wants reduced motion, shows an outline
/// instead, which stays while the button flashes. Nothing else about the button changes.
void setHighlighted(QAbstractButton& button, bool highlighted);
bool isHighlighted(const QAbstractButton& button);

/// Colours the button's face. A title without a colour turns black or white if its usual colour is
/// not readable there. An absent colour restores the button's own face.
void setFaceColor(QAbstractButton& button, const std::optional<Color>& color);
/// The colour of the face; absent if none was set.
std::optional<Color> faceColor(const QAbstractButton& button);

void setBezel(QAbstractButton& button, BezelStyle style);

}  // namespace qz::toolkit::qt
