// SPDX-License-Identifier: MIT
// The clock of the Qt toolkit's timers.
#pragma once

#include <chrono>

namespace toolkit::qt {

/// Time in seconds. Neither of the two readings ever goes back.
class Clock {
 public:
  virtual ~Clock() = default;

  /// What time it is for the application.
  virtual double now() const = 0;
  /// Up to when timers may fire. Above `now()` on a clock that stands still between firings.
  virtual double horizon() const = 0;
  /// A timer that was due then is about to fire.
  virtual void reach(double due) = 0;
};

/// The computer's own clock, which nobody can set.
class SteadyClock final : public Clock {
 public:
  double now() const override {
    return std::chrono::duration<double>(std::chrono::steady_clock::now().time_since_epoch())
        .count();
  }
  double horizon() const override { return now(); }
  void reach(double) override {}
};

}  // namespace toolkit::qt
