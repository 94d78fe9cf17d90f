// The memory toolkit's run loop: timers over a clock that moves only when it is told to.
//
// Invariants: the queue holds exactly the valid timers that are not firing at this moment, by the
// time at which they are due and then by the order of their scheduling; an invalid timer takes up
// nothing here. The clock never goes back.
#pragma once

#include <cstdint>
#include <map>
#include <memory>

#include "toolkit/run_loop.hpp"

namespace toolkit::memory {

class MemoryRunLoop final : public RunLoop {
 public:
  MemoryRunLoop() = default;
  /// Invalidates every timer. What their actions hold ends here and may still use this run loop.
  ~MemoryRunLoop() override;
  MemoryRunLoop(const MemoryRunLoop&) = delete;
  MemoryRunLoop& operator=(const MemoryRunLoop&) = delete;

  /// Raises an invalid-argument exception when there is no action. An interval that is no number
  /// counts as the least one, as does any below it.
  Ref<Timer> schedule(double interval, bool repeats, TimerAction action) override;

  /// Seconds since the run loop was made; during a firing, when that timer was due.
  double now() const { return now_; }

  /// Lets `seconds` pass, firing whatever comes due on the way; nothing below 0. A firing may let
  /// time pass itself: then the others that come due fire inside it, and its own timer does not.
  void advance(double seconds);

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

  double now_ = 0;
  std::uint64_t scheduled_ = 0;  // how many timers there have been
  Queue queue_;
};

}  // namespace toolkit::memory
