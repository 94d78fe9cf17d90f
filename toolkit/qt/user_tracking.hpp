// SPDX-License-Identifier: MIT
// Whether the user is doing something that timers wait for: holding the mouse button down on a
// control, using a menu or another pop-up, or using an application-modal window.
//
// Timers do not wait for window-modal windows (such as sheets), for event loops that a host runs,
// or for a key that is held down.
#pragma once

#include <QObject>
#include <QPointer>
#include <QWidget>
#include <functional>

class QMouseEvent;

namespace qz::toolkit::qt {

class UserTracking final : public QObject {
 public:
  /// Listens to the application's events. `mayBeOver` is called during an event after which the
  /// user may be free again. Some ends cause no call; only `userIsBusy` notices them.
  explicit UserTracking(std::function<void()> mayBeOver);

  bool userIsBusy() const;
  bool eventFilter(QObject* receiver, QEvent* event) override;

 private:
  void follow(QObject& receiver, const QMouseEvent& event);
  bool holdsControl() const;
  void letGo();

  std::function<void()> mayBeOver_;
  QPointer<QWidget> held_;      // the mouse button is down on it; null while it is up
  bool isCountedByQt_ = false;  // the mouse button: its press came from the window system
};

}  // namespace qz::toolkit::qt
