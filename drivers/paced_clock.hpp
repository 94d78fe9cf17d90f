// SPDX-License-Identifier: MIT
// A clock that runs only while its driver lets time pass, at real speed, and stops in between. The
// steps of a test thus take no time, however slow the machine.
#pragma once

#include <algorithm>
#include <chrono>

#include "qz/toolkit/clock.hpp"

namespace qz::drivers {

class PacedClock final : public toolkit::Clock {
 public:
  /// Runs the clock for at most `seconds`, while this object lives.
  class Going {
   public:
    Going(PacedClock& clock, double seconds)
        : clock_(clock), before_(clock.going_), end_(clock.now_ + seconds) {
      clock_.going_ = this;
    }
    ~Going() { clock_.going_ = before_; }
    Going(const Going&) = delete;
    Going& operator=(const Going&) = delete;

    /// Returns the time that the clock may reach at this moment.
    double horizon() const {
      const std::chrono::duration<double> passed = std::chrono::steady_clock::now() - began_;
      return std::min(start_ + passed.count(), end_);
    }
    bool isOver() const { return horizon() >= end_; }
    /// Returns how many seconds are left.
    double left() const { return end_ - horizon(); }
    /// Lets the remaining time pass at once.
    void finish() { clock_.reach(end_); }

   private:
    PacedClock& clock_;
    const Going* before_;  // stopped meanwhile
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

}  // namespace qz::drivers
