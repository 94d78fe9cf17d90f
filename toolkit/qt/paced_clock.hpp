// SPDX-License-Identifier: MIT
// A clock that goes only while its driver lets time pass, as fast as the computer's own, and stands
// still in between: so that what a test does meanwhile takes no time, on however slow a machine.
#pragma once

#include <algorithm>
#include <chrono>

#include "toolkit/qt/clock.hpp"

namespace toolkit::qt {

class PacedClock final : public Clock {
 public:
  /// While it lives the clock goes, for `seconds` at most; at its end that time has passed.
  class Going {
   public:
    Going(PacedClock& clock, double seconds)
        : clock_(clock), before_(clock.going_), end_(clock.now_ + seconds) {
      clock_.going_ = this;
    }
    ~Going() { clock_.going_ = before_; }
    Going(const Going&) = delete;
    Going& operator=(const Going&) = delete;

    /// What the clock can reach at this moment.
    double horizon() const {
      const std::chrono::duration<double> passed = std::chrono::steady_clock::now() - began_;
      return std::min(start_ + passed.count(), end_);
    }
    bool isOver() const { return horizon() >= end_; }
    /// Seconds that it still goes.
    double left() const { return end_ - horizon(); }
    /// Lets the rest of the time pass at once.
    void finish() { clock_.reach(end_); }

   private:
    PacedClock& clock_;
    const Going* before_;  // which stands still meanwhile
    const double start_ = clock_.now_;
    const double end_;
    const std::chrono::steady_clock::time_point began_ = std::chrono::steady_clock::now();
  };

  double now() const override { return now_; }
  double horizon() const override { return going_ ? std::max(now_, going_->horizon()) : now_; }
  void reach(double due) override { now_ = std::max(now_, due); }

 private:
  double now_ = 0;
  const Going* going_ = nullptr;
};

}  // namespace toolkit::qt
