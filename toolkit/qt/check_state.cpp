// SPDX-License-Identifier: MIT
// Reads and sets the states of check boxes with three states and of exclusive buttons.

#include "toolkit/qt/check_state.hpp"

#include <QButtonGroup>
#include <QCheckBox>
#include <QPointer>

namespace qz::toolkit::qt {

namespace {

QCheckBox* threeStates(const QAbstractButton& button) {
  auto* const box = qobject_cast<QCheckBox*>(const_cast<QAbstractButton*>(&button));
  return box && box->isTristate() ? box : nullptr;
}

// Suspends exclusiveness while it lives: the button can be turned off, and other buttons of its
// group keep their state. Button and group are held weakly, because a slot of the host may delete
// them.
class NotExclusive {
 public:
  explicit NotExclusive(QAbstractButton& button)
      : button_(&button),
        autoExclusive_(button.autoExclusive()),
        group_(button.group()),
        groupExclusive_(group_ && group_->exclusive()) {
    button.setAutoExclusive(false);
    if (group_) group_->setExclusive(false);
  }
  NotExclusive(const NotExclusive&) = delete;
  NotExclusive& operator=(const NotExclusive&) = delete;
  ~NotExclusive() {
    if (button_) button_->setAutoExclusive(autoExclusive_);
    if (group_) group_->setExclusive(groupExclusive_);
  }

 private:
  QPointer<QAbstractButton> button_;
  bool autoExclusive_;
  QPointer<QButtonGroup> group_;
  bool groupExclusive_;
};

}  // namespace

State checkState(const QAbstractButton& button) {
  const auto* const box = threeStates(button);
  if (box && box->checkState() == Qt::PartiallyChecked) return State::mixed;
  return button.isChecked() ? State::on : State::off;
}

void setCheckState(QAbstractButton& button, State state) {
  auto* const box = threeStates(button);
  if (box && state == State::mixed) return box->setCheckState(Qt::PartiallyChecked);
  if (state != State::off) return button.setChecked(true);
  const NotExclusive free(button);
  button.setChecked(false);
}

}  // namespace qz::toolkit::qt
