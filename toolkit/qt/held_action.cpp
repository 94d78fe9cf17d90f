// SPDX-License-Identifier: MIT
// Takes the default action from a tool button, and gives it back.

#include "toolkit/qt/held_action.hpp"

namespace qz::toolkit::qt {

HeldAction::HeldAction(QAbstractButton& button) : button_(qobject_cast<QToolButton*>(&button)) {
  if (!button_ || button_->menu()) return;
  action_ = button_->defaultAction();
  if (!action_) return;
  button_->setDefaultAction(nullptr);
  follows_ = QObject::connect(button_, &QToolButton::toggled, action_, &QAction::setChecked);
}

HeldAction::~HeldAction() {
  QObject::disconnect(follows_);
  if (button_ && action_ && !button_->defaultAction()) button_->setDefaultAction(action_);
}

}  // namespace qz::toolkit::qt
