// SPDX-License-Identifier: MIT
// Setting the one timer of Qt's.

#include "toolkit/qt/run_loop.hpp"

#include <algorithm>
#include <chrono>
#include <cmath>
#include <utility>

namespace toolkit::qt {

namespace {

// Qt counts milliseconds in an int, 24 days. Longer waits are made up of such ones, in seconds.
constexpr double longestWait = 24 * 60 * 60;

// How often to ask whether the user is still busy, in seconds. Most ends are told at once; the
// deletion of the held control is one that is not.
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
    // On a clock that stands still between firings the time passed meanwhile, too.
    if (std::exchange(waited_, false)) clock_.reach(clock_.horizon());
    calls_.make([this] { fireDue(clock_.horizon()); });
  }
  setAlarm();
}

// The firing may run an event loop of its own, in which the others fire.
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

}  // namespace toolkit::qt
