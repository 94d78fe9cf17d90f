// SPDX-License-Identifier: MIT
// Brings a widget into view inside its window.
#pragma once

class QWidget;

namespace qz::toolkit::qt {

/// Opens every place around `widget` in which the user cannot see it, from the outermost to the
/// innermost: selects its tabs, pages and sub-windows, shows its dock or tool bar, opens its pane
/// of a splitter, and scrolls to it. Widgets that are hidden for another reason stay hidden.
void bringIntoView(QWidget& widget);

}  // namespace qz::toolkit::qt
