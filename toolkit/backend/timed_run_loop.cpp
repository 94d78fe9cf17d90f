// SPDX-License-Identifier: MIT
// Times are doubles, so that an interval can be as long as a script may ask for (1.8e19 s). A
// repeating timer is due at its start plus a whole number of intervals, so that it does not drift.

#include "toolkit/backend/timed_run_loop.hpp"

#include <algorithm>
#include <cmath>
#include <utility>

#include "qz/toolkit/exception.hpp"

namespace qz::toolkit {

namespace {

// `NSTimer`'s minimum interval, in seconds.
constexpr double leastInterval = 0.0001;

// In seconds. A timer that is due this much later counts as due: ten steps of 0.1 s must make one
// second despite rounding.
constexpr double slack = 1e-9;

}  // namespace

class TimedRunLoop::ScheduledTimer final : public Timer {
 public:
  ScheduledTimer(TimedRunLoop& loop, double interval, bool repeats, TimerAction action)
      : loop_(&loop),
        interval_(interval),
        step_(interval >= leastInterval ? interval : leastInterval),
        start_(loop.now()),
        due_{start_ + step_, loop.scheduled_++},
        repeats_(repeats),
        action_(std::move(action)) {}

  bool isValid() const override { return loop_ != nullptr; }
  double interval() const override { return interval_; }
  double timeLeft() const override {
    return isValid() ? std::max(due_.time - loop_->now(), 0.0) : 0;
  }

  void invalidate() override {
    if (!loop_) return;
    // Destroyed at the end of this function, in this order: the action, whose objects may call the
    // timer, which is then invalid; then perhaps the timer itself.
    const Queue::node_type place = loop_->queue_.extract(due_);
    const TimerAction action = std::exchange(action_, nullptr);
    loop_ = nullptr;
  }

 private:
  friend class TimedRunLoop;
  friend class TimedRunLoop::Firing;

  // Sets the next due time, which is not before `now`.
  void step(double now) {
    firings_ += 1;
    // Skips firings that were missed because a firing let time pass.
    if (start_ + firings_ * step_ < now) firings_ = std::floor((now - start_) / step_) + 1;
    due_.time = start_ + firings_ * step_;
  }

  TimedRunLoop* loop_;  // outlives the valid timer; null once the timer is invalid
  double interval_;     // as passed to `schedule`
  double step_;         // the effective interval
  double start_;        // time of scheduling
  double firings_ = 1;  // whole number of intervals from `start_` to `due_`
  Due due_;
  bool repeats_;
  TimerAction action_;  // empty while it runs and once the timer is invalid
};

// One firing: takes the timer off the queue and puts it back, even if its action throws.
class TimedRunLoop::Firing {
 public:
  explicit Firing(TimedRunLoop& loop)
      : loop_(loop),
        place_(loop.queue_.extract(loop.queue_.begin())),
        timer_(place_.mapped()),
        action_(std::exchange(timer_->action_, nullptr)) {
    loop_.reach(timer_->due_.time);
  }
  Firing(const Firing&) = delete;
  Firing& operator=(const Firing&) = delete;

  void run() { action_(timer_); }

  ~Firing() {
    if (!timer_->repeats_) timer_->invalidate();
    if (!timer_->isValid()) return;
    timer_->action_ = std::move(action_);
    timer_->step(loop_.now());
    place_.key() = timer_->due_;
    loop_.queue_.insert(std::move(place_));
  }

 private:
  TimedRunLoop& loop_;
  Queue::node_type place_;
  std::shared_ptr<ScheduledTimer> timer_;
  TimerAction action_;  // not in the timer, which may be invalidated while the action runs
};

void TimedRunLoop::invalidateAll() {
  while (!queue_.empty()) queue_.begin()->second->invalidate();
}

Ref<Timer> TimedRunLoop::schedule(double interval, bool repeats, TimerAction action) {
  if (!action) throw InvalidArgumentException("schedule: a timer needs an action, got none");
  const auto timer = std::make_shared<ScheduledTimer>(*this, interval, repeats, std::move(action));
  queue_.emplace(timer->due_, timer);
  return timer;
}

void TimedRunLoop::fireDue(double until) {
  while (isInDefaultMode() && !queue_.empty() && queue_.begin()->first.time <= until + slack) {
    Firing(*this).run();
  }
}

std::optional<double> TimedRunLoop::nextDue() const {
  return queue_.empty() ? std::nullopt : std::optional(queue_.begin()->first.time);
}

}  // namespace qz::toolkit
