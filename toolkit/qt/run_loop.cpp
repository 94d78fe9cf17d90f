// SPDX-License-Identifier: MIT
// Sets the single Qt timer.

#include "toolkit/qt/run_loop.hpp"

#include <algorithm>
#include <chrono>
#include <cmath>
#include <utility>

namespace qz::toolkit::qt {

namespace {

// In seconds. Qt counts milliseconds in an int, which holds 24 days; longer waits consist of
// several of these.
constexpr double longestWait = 24 * 60 * 60;

// How often to check whether the user is still busy, in seconds. Most ends are reported at once;
// the deletion of the held control is not.
constexpr double lookAgain = 0.1;

}  // namespace

QtRunLoop::QtRunLoop(Clock& clock, Calls& calls)
    : clock_(clock), calls_(calls), tracking_([this] { setAlarm(0); }) {
  alarm_.setSingleShot(true);
  alarm_.setTimerType(Qt::PreciseTimer);
  alarm_.callOnTimeout([this] { wake(); });
}

QtRunLoop::~QtRunLoop() { invalidateAll(); }

Ref<Timer> QtRunLoop::schedule(double interval, bool repeats, TimerAction action) {
  auto timer = TimedRunLoop::schedule(interval, repeats, std::move(action));
  setAlarm();
  return timer;
}

void QtRunLoop::wake() {
  if (!isInDefaultMode()) {
    waited_ = true;
  } else {
    // Also lets the time of the wait pass on a clock that stops between firings.
    if (std::exchange(waited_, false)) clock_.reach(clock_.horizon());
    calls_.make([this] { fireDue(clock_.horizon()); });
  }
  setAlarm();
}

// A firing timer may run its own event loop, in which the other timers must fire.
void QtRunLoop::reach(double due) {
  clock_.reach(due);
  setAlarm();
}

void QtRunLoop::setAlarm() { setAlarm(isInDefaultMode() ? 0 : lookAgain); }

void QtRunLoop::setAlarm(double leastWait) {
  const auto due = nextDue();
  if (!due) return alarm_.stop();
  const double wait = std::clamp(*due - clock_.horizon(), leastWait, longestWait);
  alarm_.start(std::chrono::milliseconds(std::llround(std::ceil(wait * 1000))));
}

}  // namespace qz::toolkit::qt
