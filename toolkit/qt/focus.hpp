// SPDX-License-Identifier: MIT
// The keyboard's focus.
#pragma once

class QWidget;

namespace toolkit::qt {

/// Takes the focus from `widget` and what lies in it, which is about to be hidden or disabled, and
/// gives it to the next one in the window's order that can take it; if there is none, nothing has
/// it.
void giveFocusAway(QWidget& widget);

}  // namespace toolkit::qt
