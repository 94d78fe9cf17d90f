// SPDX-License-Identifier: MIT
// What buttons show: titles with attributes, the pressed-in look, colours, bezels.
//
// Push buttons, check boxes, radio buttons and tool buttons are drawn by the widget's own style,
// but for what it does not know: the title's attributes, the colour, the square bezel. Buttons of
// other classes draw themselves; there the font and the colour that all of the title has are given
// to the widget, and the face's colour is laid over what it has drawn. A highlight adds two frames,
// one dark and one light, as styles and style sheets may draw both looks alike.
// `QAbstractButton::down` is the user's alone: were it reset by a flash while they hold the button
// down, Qt would drop their click.
#pragma once

#include <optional>
#include <string_view>

#include "toolkit/styled_text/attributed_string.hpp"
#include "toolkit/view.hpp"

class QAbstractButton;

namespace toolkit::qt {

/// Shows a plain title in the button's own font and colour. An ampersand is one, no mnemonic.
void showTitle(QAbstractButton& button, std::string_view title);
void showTitle(QAbstractButton& button, const AttributedString& title);
/// The very title that was shown last; without attributes where the host has set another since. A
/// host's mnemonic is no part of the title.
AttributedString shownTitle(const QAbstractButton& button);

/// The pressed-in look; where the user wants no motion, an outline that stays while it comes and
/// goes. Nothing else about the button changes.
void setHighlighted(QAbstractButton& button, bool highlighted);
bool isHighlighted(const QAbstractButton& button);

/// Colours the button's face; a title without a colour is black or white, what reads better there.
/// An absent colour gives the button its own face back.
void setFaceColor(QAbstractButton& button, const std::optional<Color>& color);
/// Absent when it was given none.
std::optional<Color> faceColor(const QAbstractButton& button);

void setBezel(QAbstractButton& button, BezelStyle style);

/// The dynamic property of the application, and the environment variable, that ask for no motion
/// when they are set to anything but "0": Qt 6.4 does not hand on the desktop's own setting.
inline constexpr const char* reducedMotionProperty = "qzReducedMotion";
inline constexpr const char* reducedMotionVariable = "QZ_REDUCED_MOTION";

}  // namespace toolkit::qt
