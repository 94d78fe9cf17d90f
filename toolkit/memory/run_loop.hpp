// SPDX-License-Identifier: MIT
// The memory toolkit's run loop: timers on a clock that moves only on request.
#pragma once

#include <algorithm>

#include "toolkit/backend/timed_run_loop.hpp"

namespace qz::toolkit::memory {

class MemoryRunLoop final : public TimedRunLoop {
 public:
  MemoryRunLoop() = default;
  /// Invalidates every timer. The objects held by their actions are destroyed here and may still
  /// use this run loop.
  ~MemoryRunLoop() override { invalidateAll(); }

  /// Returns the seconds since the run loop was made. During a firing this is the time at which the
  /// timer was due, or at which it stopped waiting for the user if that is later.
  double now() const override { return now_; }

  /// Lets `seconds` pass and fires the timers that come due on the way; a negative value counts as
  /// 0. If a firing itself lets time pass, the other timers that come due fire inside it; its own
  /// timer does not.
  void advance(double seconds);

  bool isInDefaultMode() const override { return !userIsBusy_; }
  /// Sets whether the user is busy; timers wait meanwhile. The timers that are then due fire in the
  /// next `advance`, even one of 0 seconds.
  void setUserIsBusy(bool busy) { userIsBusy_ = busy; }

 private:
  void reach(double due) override { now_ = std::max(now_, due); }

  double now_ = 0;
  bool userIsBusy_ = false;
};

}  // namespace qz::toolkit::memory
