// SPDX-License-Identifier: MIT
// Keeps a tool button from triggering its action.
#pragma once

#include <QAction>
#include <QPointer>
#include <QToolButton>

class QAbstractButton;

namespace qz::toolkit::qt {

/// While it exists, a press of a tool button does not trigger the button's action: Qt triggers it
/// before it emits `released`. A checkable action follows the button. Does nothing to other
/// buttons, and to tool buttons with a menu.
class HeldAction {
 public:
  explicit HeldAction(QAbstractButton& button);
  ~HeldAction();
  HeldAction(const HeldAction&) = delete;
  HeldAction& operator=(const HeldAction&) = delete;

 private:
  QPointer<QToolButton> button_;
  QPointer<QAction> action_;
  QMetaObject::Connection follows_;
};

}  // namespace qz::toolkit::qt
