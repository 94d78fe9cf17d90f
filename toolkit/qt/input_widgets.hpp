// SPDX-License-Identifier: MIT
// Telling the widgets that a user acts on from those that only show something or hold others.
#pragma once

class QWidget;

namespace toolkit::qt {

/// Whether the user can act on the widget itself, if it is enabled: buttons, fields, lists, sliders
/// and the like; a group box that can be checked; any widget of the host's that takes the focus.
bool takesInput(const QWidget& widget);

}  // namespace toolkit::qt
