// SPDX-License-Identifier: MIT
// The AppKit toolkit's run loop: timers that fire from the main run loop in its default mode.
//
// A single `NSTimer` serves all timers and is set to the earliest due time. So the order is the
// queue's. While the user holds a control or a modal session runs, AppKit runs the loop in other
// modes, and the timers wait.
#pragma once

#import <AppKit/AppKit.h>

#include "qz/toolkit/calls.hpp"
#include "qz/toolkit/clock.hpp"
#include "toolkit/backend/timed_run_loop.hpp"
#import "toolkit/foundation/kept.hpp"

namespace qz::toolkit::appkit {

class AppKitRunLoop final : public TimedRunLoop {
 public:
  /// Both must outlive the run loop.
  AppKitRunLoop(Clock& clock, Calls& calls);
  /// Invalidates every timer. Objects that their actions hold end here and may still use this run
  /// loop.
  ~AppKitRunLoop() override;

  Ref<Timer> schedule(double interval, bool repeats, TimerAction action) override;
  double now() const override { return clock_.now(); }
  bool isInDefaultMode() const override { return !userIsBusy_; }
  using TimedRunLoop::nextDue;

  /// Sets whether the user is busy although the loop runs in its default mode, for a driver that
  /// holds a button down without AppKit's tracking loop.
  void setUserIsBusy(bool busy) { userIsBusy_ = busy; }

  /// Fires due timers and sets the `NSTimer` again, as the clock's speed may have changed.
  void wake();
  /// Sets the `NSTimer` to the timer that is due first. Must be called when the clock's pace
  /// changes.
  void setAlarm();

 private:
  void reach(double due) override;

  Clock& clock_;
  Calls& calls_;
  foundation::Kept<id> wakener_;      // the target of `alarm_`
  foundation::Kept<NSTimer*> alarm_;  // set to the timer that is due first
  bool userIsBusy_ = false;
};

}  // namespace qz::toolkit::appkit
