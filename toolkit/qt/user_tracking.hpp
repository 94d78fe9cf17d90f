// SPDX-License-Identifier: MIT
// Whether the user is in the middle of something that timers wait for: holds the mouse button down
// on a control, has a menu or another pop-up open, or is in an application-modal window.
//
// Timers do not wait for window-modal windows, sheets among them, for event loops that a host runs,
// and for a key that is held down.
#pragma once

#include <QObject>
#include <QPointer>
#include <QWidget>
#include <functional>

class QMouseEvent;

namespace toolkit::qt {

class UserTracking final : public QObject {
 public:
  /// Listens to the application's events. `mayBeOver` is called from within an event; the user may
  /// be free again once that event is handled. Some ends are not told: `userIsBusy` knows of them.
  explicit UserTracking(std::function<void()> mayBeOver);

  bool userIsBusy() const;
  bool eventFilter(QObject* receiver, QEvent* event) override;

 private:
  void follow(QObject& receiver, const QMouseEvent& event);
  bool holdsControl() const;
  void letGo();

  std::function<void()> mayBeOver_;
  QPointer<QWidget> held_;      // the mouse button is down on it; null while it is up
  bool isCountedByQt_ = false;  // that mouse button: it came from the window system
};

}  // namespace toolkit::qt
