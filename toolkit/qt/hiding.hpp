// SPDX-License-Identifier: MIT
// Widgets that Qt hides and shows itself: those that show an action, and the pages of tabs.
#pragma once

class QAction;
class QWidget;

namespace qz::toolkit::qt {

/// Returns the action that a tool bar shows as `widget`; null if there is none.
QAction* actionShownBy(const QWidget& widget);

/// Whether a widget is hidden for itself, and not because of a widget around it. A menu is hidden
/// if its menu bar, tool button or menu does not show it, and a page if its tab is hidden; whether
/// it is open is the user's choice.
bool isHiddenInForm(const QWidget& widget);
void setHiddenInForm(QWidget& widget, bool hidden);

}  // namespace qz::toolkit::qt
