// SPDX-License-Identifier: MIT
// The clock of a toolkit's timers.
#pragma once

#include <chrono>

#include "qz/api.hpp"

namespace qz::toolkit {

/// Time in seconds. Neither `now()` nor `horizon()` ever goes back.
class QZ_API Clock {
 public:
  virtual ~Clock() = default;

  /// Returns the application's time.
  virtual double now() const = 0;
  /// Returns the time up to which timers may fire. Later than `now()` on a clock that stops between
  /// firings.
  virtual double horizon() const = 0;
  /// Tells the clock that a timer due at `due` is about to fire.
  virtual void reach(double due) = 0;
};

/// The computer's monotonic clock, which cannot be set.
class QZ_API SteadyClock final : public Clock {
 public:
  double now() const override {
    return std::chrono::duration<double>(std::chrono::steady_clock::now().time_since_epoch())
        .count();
  }
  double horizon() const override { return now(); }
  void reach(double) override {}
};

}  // namespace qz::toolkit
