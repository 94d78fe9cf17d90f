// SPDX-License-Identifier: MIT
// The states of Qt's checkable buttons.
#pragma once

#include "qz/toolkit/view.hpp"

class QAbstractButton;

namespace qz::toolkit::qt {

State checkState(const QAbstractButton& button);

/// Sets the state without a click. A button without a mixed state turns on instead. An exclusive
/// button turns off too, though Qt allows that only by a click on another button.
void setCheckState(QAbstractButton& button, State state);

}  // namespace qz::toolkit::qt
