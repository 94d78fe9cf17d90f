// SPDX-License-Identifier: MIT
// A run loop but for its clock: the queue of timers, and firing those that are due.
//
// Invariants: the queue holds exactly the valid timers that are not firing at this moment, by the
// time at which they are due and then by the order of their scheduling; an invalid timer takes up
// nothing here.
#pragma once

#include <cstdint>
#include <map>
#include <memory>
#include <optional>

#include "toolkit/run_loop.hpp"

namespace toolkit {

class TimedRunLoop : public RunLoop {
 public:
  TimedRunLoop() = default;
  TimedRunLoop(const TimedRunLoop&) = delete;
  TimedRunLoop& operator=(const TimedRunLoop&) = delete;

  /// Raises an invalid-argument exception when there is no action. An interval that is no number
  /// counts as the least one, as does any below it.
  Ref<Timer> schedule(double interval, bool repeats, TimerAction action) override;

  /// Seconds since a fixed moment. Never goes back.
  virtual double now() const = 0;

  /// Whether timers may fire: not while the user is busy.
  virtual bool isInDefaultMode() const = 0;

 protected:
  /// Called with the time at which a timer was due, before each firing; the queue is without it.
  virtual void reach(double due) = 0;

  /// Fires what is due up to `until`, in order, as long as the run loop is in its default mode;
  /// what a firing schedules counts too. A firing may let time pass itself: then the others that
  /// come due fire inside it, and its own timer does not. Of the firings that a repeating timer
  /// missed by `now()` none is made up for.
  void fireDue(double until);
  /// When the next timer is due; nothing where there is none.
  std::optional<double> nextDue() const;
  /// Invalidates every timer. What their actions hold ends here and may still use this run loop, so
  /// that the destructors of the derived classes call it, and none is left for this one's.
  void invalidateAll();

 private:
  class ScheduledTimer;
  class Firing;

  struct Due {
    double time;          // on this clock, in seconds
    std::uint64_t order;  // of scheduling; unique
    bool operator<(const Due& other) const {
      return time < other.time || (time == other.time && order < other.order);
    }
  };
  using Queue = std::map<Due, std::shared_ptr<ScheduledTimer>>;

  std::uint64_t scheduled_ = 0;  // how many timers there have been
  Queue queue_;
};

}  // namespace toolkit
