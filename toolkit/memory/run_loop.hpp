// SPDX-License-Identifier: MIT
// The memory toolkit's run loop: timers over a clock that moves only when it is told to.
#pragma once

#include <algorithm>

#include "toolkit/timed_run_loop.hpp"

namespace toolkit::memory {

class MemoryRunLoop final : public TimedRunLoop {
 public:
  MemoryRunLoop() = default;
  /// Invalidates every timer. What their actions hold ends here and may still use this run loop.
  ~MemoryRunLoop() override { invalidateAll(); }

  /// Seconds since the run loop was made; during a firing, when that timer was due, or when it
  /// ceased to wait for the user.
  double now() const override { return now_; }

  /// Lets `seconds` pass, firing whatever comes due on the way; nothing below 0. A firing may let
  /// time pass itself: then the others that come due fire inside it, and its own timer does not.
  void advance(double seconds);

  bool isInDefaultMode() const override { return !userIsBusy_; }
  /// While the user is busy timers wait. Those that are due by the end of that fire in the next
  /// `advance`, be it of 0 seconds.
  void setUserIsBusy(bool busy) { userIsBusy_ = busy; }

 private:
  void reach(double due) override { now_ = std::max(now_, due); }

  double now_ = 0;
  bool userIsBusy_ = false;
};

}  // namespace toolkit::memory
