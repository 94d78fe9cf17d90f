// SPDX-License-Identifier: MIT
// The keyboard's focus.
#pragma once

class QWidget;

namespace qz::toolkit::qt {

/// True if the Tab key can reach the widget in its window.
bool takesFocus(const QWidget& widget);

/// Moves the keyboard focus away from `widget` and its descendants, which are about to be hidden or
/// disabled, to the next widget in the window's tab order that accepts it. If there is none, clears
/// the focus.
void giveFocusAway(QWidget& widget);

}  // namespace qz::toolkit::qt
