// SPDX-License-Identifier: MIT
// Tells widgets that take input from those that only show something or hold others.
#pragma once

class QWidget;

namespace qz::toolkit::qt {

/// True if the user can act on the widget itself when it is enabled: buttons, fields, lists,
/// sliders and the like; a checkable group box; any widget of the host that takes the focus.
bool takesInput(const QWidget& widget);

}  // namespace qz::toolkit::qt
