// SPDX-License-Identifier: MIT
// The Qt toolkit's run loop: timers that fire from Qt's event loop.
//
// A single Qt timer serves all timers and is set to the earliest due time. So the order is the
// queue's, and an interval may exceed the limit of Qt's timers. While the user is busy, Qt's event
// loop continues and the timers wait.
#pragma once

#include <QTimer>

#include "qz/toolkit/qt/calls.hpp"
#include "qz/toolkit/qt/clock.hpp"
#include "toolkit/backend/timed_run_loop.hpp"
#include "toolkit/qt/user_tracking.hpp"

namespace qz::toolkit::qt {

class QtRunLoop final : public TimedRunLoop {
 public:
  /// Both must outlive the run loop.
  QtRunLoop(Clock& clock, Calls& calls);
  /// Invalidates every timer. Objects that their actions hold end here and may still use this run
  /// loop.
  ~QtRunLoop() override;

  Ref<Timer> schedule(double interval, bool repeats, TimerAction action) override;
  double now() const override { return clock_.now(); }
  bool isInDefaultMode() const override { return !tracking_.userIsBusy(); }
  using TimedRunLoop::nextDue;

  /// Fires due timers and sets the Qt timer again, as the clock's speed may have changed.
  void wake();
  /// Sets the Qt timer to the timer that is due first. Must be called when the clock's pace
  /// changes.
  void setAlarm();

 private:
  void reach(double due) override;
  void setAlarm(double leastWait);

  Clock& clock_;
  Calls& calls_;
  QTimer alarm_;  // set to the timer that is due first
  UserTracking tracking_;
  bool waited_ = false;  // for the user, since the last firing
};

}  // namespace qz::toolkit::qt
