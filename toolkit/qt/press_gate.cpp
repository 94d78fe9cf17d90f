// SPDX-License-Identifier: MIT
// Qt emits `released` right before `clicked`, and lets the button's group repeat each of them right
// after it. So the gate is shut at the last signal before `clicked`: it blocks the button's signals
// and stands in for its group, which nobody else listens to. The group's `buttonClicked`, the last
// signal of a press, opens it again.
//
// A button may be released without a click, for example if the user moves the mouse off it. Then
// the next event of the user, or the event loop, opens the gate.

#include "toolkit/qt/press_gate.hpp"

#include <QAbstractButton>
#include <QEvent>
#include <utility>

namespace qz::toolkit::qt {

PressGate::PressGate(QAbstractButton& button, std::function<bool()> takes,
                     std::function<void()> pressed)
    : button_(&button), takes_(std::move(takes)), pressed_(std::move(pressed)) {
  gate_.setExclusive(false);
  button.installEventFilter(this);
  connect(&button, &QAbstractButton::released, this, &PressGate::released);
  connect(&gate_, &QButtonGroup::buttonClicked, this, &PressGate::clicked);
}

PressGate::~PressGate() { open(); }

bool PressGate::eventFilter(QObject*, QEvent* event) {
  switch (event->type()) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonDblClick:
    case QEvent::MouseButtonRelease:
    case QEvent::MouseMove:
    case QEvent::KeyPress:
    case QEvent::KeyRelease:
    case QEvent::Shortcut:
      open();
      break;
    default:
      break;
  }
  return false;
}

// The group repeats the signal; the host is to hear it there too.
void PressGate::released() {
  if (isShut_ || !takes_()) return;
  if (const QButtonGroup* const group = button_->group()) {
    connect(group, &QButtonGroup::buttonReleased, this, &PressGate::groupReleased,
            static_cast<Qt::ConnectionType>(Qt::AutoConnection | Qt::SingleShotConnection));
  } else {
    shut();
  }
}

void PressGate::groupReleased(QAbstractButton* released) {
  if (button_ && released == button_ && !isShut_) shut();
}

void PressGate::shut() {
  isShut_ = true;
  leaveGroup();
  gate_.addButton(button_);
  button_->blockSignals(true);
  const unsigned shutting = ++shuttings_;
  const auto openIfStillShut = [this, shutting] {
    if (shutting == shuttings_) open();
  };
  QMetaObject::invokeMethod(this, openIfStillShut, Qt::QueuedConnection);
}

void PressGate::open() {
  if (!std::exchange(isShut_, false) || !button_) return;
  button_->blockSignals(false);
  gate_.removeButton(button_);
  returnToGroup();
}

void PressGate::clicked() {
  open();
  const auto pressed = pressed_;  // a copy: the press may end the gate
  pressed();
}

void PressGate::leaveGroup() {
  group_ = button_->group();
  if (!group_) return;
  id_ = group_->id(button_);
  place_ = group_->buttons().indexOf(button_);
  group_->removeButton(button_);
}

// A button is added as the last one, so those that were behind it are added again.
void PressGate::returnToGroup() {
  if (!group_) return;
  const auto others = group_->buttons();
  group_->addButton(button_, id_);
  for (QAbstractButton* const other : others.mid(place_)) {
    const int id = group_->id(other);
    group_->removeButton(other);
    group_->addButton(other, id);
  }
}

}  // namespace qz::toolkit::qt
