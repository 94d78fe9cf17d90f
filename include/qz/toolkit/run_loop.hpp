// SPDX-License-Identifier: MIT
// Timers and the clock that drives them.
//
// Invariants of every run loop: timers fire on the thread that scheduled them, between events, in
// the order of their fire times. Timers with equal fire times fire in the order in which they were
// scheduled. A timer never fires inside its own firing. An invalid timer never fires and never
// becomes valid again.
//
// Timers belong to the default mode. While the user is busy (holds the mouse button down on a
// control, has a menu open, or is in an application-modal session) the run loop is in another mode:
// time passes, but timers wait. The timers that are due fire as soon as the user is no longer busy,
// after the event that ended it has been handled.
#pragma once

#include <functional>

#include "qz/api.hpp"
#include "qz/toolkit/ref.hpp"

namespace qz::toolkit {

/// A scheduled call, modelled on `NSTimer`.
class QZ_API Timer {
 public:
  virtual ~Timer() = default;
  /// Returns the object behind absent references: it answers zero, NO or absent, and changes do
  /// nothing.
  static Timer& nothing();

  /// Whether the timer can still fire. A one-shot timer becomes invalid after its firing.
  virtual bool isValid() const = 0;

  /// Removes the timer from the run loop and releases its action. Allowed during its own firing.
  virtual void invalidate() = 0;

  /// The seconds between scheduling and firing, and between the firings of a repeating timer, as
  /// passed to `schedule`.
  virtual double interval() const = 0;

  /// The seconds until the next firing; 0 if the timer is due or invalid.
  virtual double timeLeft() const = 0;
};

/// Called when a timer fires, with the timer itself.
using TimerAction = std::function<void(const Ref<Timer>&)>;

/// Schedules timers.
class QZ_API RunLoop {
 public:
  virtual ~RunLoop() = default;

  /// Schedules a timer that fires after `interval` seconds, once or repeatedly. Until the timer is
  /// invalid, the run loop keeps it alive and the timer keeps `action`. Any finite interval is
  /// allowed; one below 0.0001 s counts as 0.0001 s (`NSTimer`'s minimum).
  virtual Ref<Timer> schedule(double interval, bool repeats, TimerAction action) = 0;
};

}  // namespace qz::toolkit
