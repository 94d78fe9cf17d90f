// SPDX-License-Identifier: MIT
// Leads the presses of an action away from the host, without touching the host's connections.
#pragma once

#include <QAction>
#include <QActionGroup>
#include <QObject>
#include <QPointer>
#include <functional>

namespace qz::toolkit::qt {

/// While it exists, menus show a copy of an action in the action's place. The copy follows the
/// action, and its presses, those by shortcuts too, are this object's. An action that its host
/// triggers in code is the host's, and so is its button in a tool bar. May be destroyed at any
/// time, even in a press.
class ActionStandIn final : public QObject {
 public:
  /// `pressed` is called for each press, with the state that a checkable action is to have.
  ActionStandIn(QAction& action, std::function<void(bool on)> pressed);
  ~ActionStandIn() override;

  /// Returns the action in whose place menus show `shown`, or `shown` itself; null if it is gone.
  static QAction* actionBehind(QAction& shown);
  /// Returns the action that menus show.
  QAction* shown() const { return copy_; }

  bool eventFilter(QObject* receiver, QEvent* event) override;

 private:
  class Copy;

  void follow();
  void triggered(bool on);

  const QPointer<QAction> action_;
  const QPointer<QAction> copy_;  // a Copy
  const std::function<void(bool)> pressed_;
  QActionGroup lone_{nullptr};  // makes the copy look as if it were in an exclusive group
};

}  // namespace qz::toolkit::qt
