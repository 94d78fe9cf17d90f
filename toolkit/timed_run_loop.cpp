// SPDX-License-Identifier: MIT
// Times are doubles, so that an interval can be as long as a script asks for (1.8e19 s) and longer.
// A repeating timer is due at its start plus a whole number of intervals, which does not drift.

#include "toolkit/timed_run_loop.hpp"

#include <algorithm>
#include <cmath>
#include <utility>

#include "toolkit/exception.hpp"

namespace toolkit {

namespace {

// `NSTimer`'s least interval, in seconds.
constexpr double leastInterval = 0.0001;

// A timer that is due this much later, in seconds, is due now: ten times 0.1 s is one second to
// whoever lets the time pass, whatever the sum of the doubles is.
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
    // Both may end when this function does: the action's holdings, which may come back here to an
    // invalid timer, and then the timer.
    const Queue::node_type place = loop_->queue_.extract(due_);
    const TimerAction action = std::exchange(action_, nullptr);
    loop_ = nullptr;
  }

 private:
  friend class TimedRunLoop;
  friend class TimedRunLoop::Firing;

  // Sets when it is due again, of times not before `now`.
  void step(double now) {
    firings_ += 1;
    // What was missed, because a firing let time pass, is not made up for.
    if (start_ + firings_ * step_ < now) firings_ = std::floor((now - start_) / step_) + 1;
    due_.time = start_ + firings_ * step_;
  }

  TimedRunLoop* loop_;  // outlives the timer's validity; null from the moment it is invalid
  double interval_;     // as given
  double step_;         // the interval that counts
  double start_;        // when it was scheduled
  double firings_ = 1;  // intervals from `start_` to `due_`; whole
  Due due_;
  bool repeats_;
  TimerAction action_;  // empty while it runs, and once the timer is invalid
};

// One firing, from taking the timer off the queue to putting it back, also when its action throws.
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
  TimerAction action_;  // here and not in the timer, which may be invalidated while it runs
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
  while (isInDefaultMode() && !queue_.empty() && queue_.begin()->first.time <= until + slack)
    Firing(*this).run();
}

std::optional<double> TimedRunLoop::nextDue() const {
  return queue_.empty() ? std::nullopt : std::optional(queue_.begin()->first.time);
}

}  // namespace toolkit
