// SPDX-License-Identifier: MIT
// A run loop without a clock: keeps the queue of timers and fires those that are due.
//
// Invariants: the queue holds exactly the valid timers that are not firing now, sorted by due time
// and then by the order of scheduling. Invalid timers take up no space.
#pragma once

#include <cstdint>
#include <map>
#include <memory>
#include <optional>

#include "qz/toolkit/run_loop.hpp"

namespace qz::toolkit {

class TimedRunLoop : public RunLoop {
 public:
  TimedRunLoop() = default;
  TimedRunLoop(const TimedRunLoop&) = delete;
  TimedRunLoop& operator=(const TimedRunLoop&) = delete;

  /// Raises an invalid-argument exception if `action` is empty. An interval that is NaN or below
  /// the minimum counts as the minimum.
  Ref<Timer> schedule(double interval, bool repeats, TimerAction action) override;

  /// Returns the seconds since a fixed moment. Never decreases.
  virtual double now() const = 0;

  /// Whether timers may fire; NO while the user is busy.
  virtual bool isInDefaultMode() const = 0;

  /// Invalidates every timer. This destroys the objects held by their actions, which may still use
  /// the run loop and its toolkit. Therefore the destructors of derived classes and of toolkits
  /// must call it: this class's destructor runs too late.
  void invalidateAll();

 protected:
  /// Called before each firing with the time at which the timer was due. The timer is already off
  /// the queue.
  virtual void reach(double due) = 0;

  /// Fires the timers that are due up to `until`, in order, while the run loop is in its default
  /// mode, including timers that a firing schedules. If a firing itself lets time pass, the other
  /// timers that come due fire inside it; its own timer does not. A repeating timer skips the
  /// firings that it has missed.
  void fireDue(double until);
  /// Returns the time at which the next timer is due; absent if there is no timer.
  std::optional<double> nextDue() const;

 private:
  class ScheduledTimer;
  class Firing;

  struct Due {
    double time;          // on this clock, in seconds
    std::uint64_t order;  // the number of its scheduling; unique
    bool operator<(const Due& other) const {
      return time < other.time || (time == other.time && order < other.order);
    }
  };
  using Queue = std::map<Due, std::shared_ptr<ScheduledTimer>>;

  std::uint64_t scheduled_ = 0;  // number of timers scheduled so far
  Queue queue_;
};

}  // namespace qz::toolkit
