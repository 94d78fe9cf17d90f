// SPDX-License-Identifier: MIT
// The Qt toolkit's run loop: timers that fire from Qt's event loop.
//
// One timer of Qt's stands for all: it is set to the one that is due first. So the order is the
// queue's, and an interval may be longer than Qt's timers can be set to. While the user is busy,
// Qt's event loop goes on and the timers wait.
#pragma once

#include <QTimer>

#include "toolkit/qt/calls.hpp"
#include "toolkit/qt/clock.hpp"
#include "toolkit/qt/user_tracking.hpp"
#include "toolkit/timed_run_loop.hpp"

namespace toolkit::qt {

class QtRunLoop final : public TimedRunLoop {
 public:
  /// Both outlive the run loop.
  QtRunLoop(Clock& clock, Calls& calls);
  /// Invalidates every timer. What their actions hold ends here and may still use this run loop.
  ~QtRunLoop() override;

  Ref<Timer> schedule(double interval, bool repeats, TimerAction action) override;
  double now() const override { return clock_.now(); }
  bool isInDefaultMode() const override { return !tracking_.userIsBusy(); }
  using TimedRunLoop::nextDue;

  /// Fires what is due, and looks at the clock afresh: it may go faster or slower than before.
  void wake();

 private:
  void reach(double due) override;
  void setAlarm();
  void setAlarm(double leastWait);

  Clock& clock_;
  Calls& calls_;
  QTimer alarm_;  // of the timer that is due first
  UserTracking tracking_;
  bool waited_ = false;  // for the user, since the last firing
};

}  // namespace toolkit::qt
