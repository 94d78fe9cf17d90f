// SPDX-License-Identifier: MIT
// The states of Qt's checkable buttons.
#pragma once

#include "toolkit/view.hpp"

class QAbstractButton;

namespace toolkit::qt {

State checkState(const QAbstractButton& button);

/// Sets the state without a click. A button that has no mixed state turns on. One that is exclusive
/// among others turns off too, though Qt lets only a click on another do that.
void setCheckState(QAbstractButton& button, State state);

}  // namespace toolkit::qt
