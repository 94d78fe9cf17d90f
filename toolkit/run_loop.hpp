// SPDX-License-Identifier: MIT
// Timers and the clock that drives them.
//
// Invariants of every run loop: timers fire on the thread that scheduled them, between events, in
// the order of their fire times and, among equal ones, of their scheduling. A timer never fires
// inside its own firing. An invalid timer never fires and never becomes valid again.
//
// Timers belong to the default mode. While the user is busy (holds the mouse button down on a
// control, has a menu open, is in an application-modal session) the run loop is in another mode:
// time goes on, and timers wait. Those that are due fire as soon as that is over, after what the
// user did to end it.
#pragma once

#include <functional>

#include "toolkit/ref.hpp"

namespace toolkit {

/// A scheduled call, after `NSTimer`.
class Timer {
 public:
  virtual ~Timer() = default;
  static Timer& nothing();

  /// Whether it can still fire. A one-shot timer turns invalid when its firing is over.
  virtual bool isValid() const = 0;

  /// Takes it off the run loop, also during its own firing, and releases its action.
  virtual void invalidate() = 0;

  /// Seconds between scheduling and firing, and between two firings when it repeats, as given.
  virtual double interval() const = 0;

  /// Seconds until it fires next; 0 when it is due or invalid.
  virtual double timeLeft() const = 0;
};

/// What a firing timer calls; it is handed the timer itself.
using TimerAction = std::function<void(const Ref<Timer>&)>;

class RunLoop {
 public:
  virtual ~RunLoop() = default;

  /// Schedules a timer that fires after `interval` seconds, once or again and again. The run loop
  /// keeps the timer, and the timer keeps `action` and all that it holds, until it is invalid.
  /// Any finite interval is taken; below 0.0001 s it counts as that (`NSTimer`'s least interval).
  virtual Ref<Timer> schedule(double interval, bool repeats, TimerAction action) = 0;
};

}  // namespace toolkit
