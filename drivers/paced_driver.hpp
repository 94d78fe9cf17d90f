// SPDX-License-Identifier: MIT
// What the drivers of toolkits with real windows share: a clock that runs only while they let time
// pass, a person's turn, and the exceptions of actions and timers.
#pragma once

#include <algorithm>
#include <exception>
#include <functional>
#include <limits>
#include <optional>
#include <string>
#include <utility>

#include "drivers/paced_clock.hpp"
#include "qz/drivers/driver.hpp"

namespace qz::drivers {

/// `Platform` is the class of the toolkit. A source that includes the toolkit's parts instantiates
/// this explicitly.
template <class Platform>
class PacedDriver : public Driver {
 public:
  PacedDriver() {
    setLogSink({});
    toolkit_.calls().setHandler([this](const std::exception_ptr& thrown) {
      if (!thrown_) thrown_ = thrown;
    });
  }
  PacedDriver(const PacedDriver&) = delete;
  PacedDriver& operator=(const PacedDriver&) = delete;

  Platform& toolkit() final { return toolkit_; }
  void setResourcePath(std::string_view path) final { toolkit_.files().setResourcePath(path); }
  /// The clock runs only during this call and `handOver`.
  void advance(double seconds) override;
  void useRealTime() final { realTime_ = true; }
  void handOver(const std::function<void(const Ref<View>&)>& willAct,
                const std::function<bool()>& goesOn) final;
  bool draws() const final { return true; }
  void setLogSink(std::function<void(std::string_view)> sink) final {
    toolkit_.log().setSink(sink ? std::move(sink) : [](std::string_view) {});
  }

 protected:
  /// Handles the events that wait, and draws what has changed.
  virtual void settle() = 0;
  /// Waits for events and handles them, for at most `seconds`.
  virtual void awaitEvents(double seconds) = 0;

  /// Raises what an action or a timer has thrown since the last call.
  void raiseWhatWasThrown() {
    if (thrown_) std::rethrow_exception(std::exchange(thrown_, nullptr));
  }
  static std::optional<std::string> nameOf(const Ref<Image>& image) {
    return image ? std::optional(image->name()) : std::nullopt;
  }

  PacedClock clock_;

 private:
  void wait(double seconds);
  void jump(double seconds);

  bool realTime_ = false;
  std::exception_ptr thrown_;

 protected:
  Platform toolkit_{clock_};  // the last member: while it ends, its calls may still throw
};

template <class Platform>
void PacedDriver<Platform>::advance(double seconds) {
  if (realTime_) {
    wait(std::max(seconds, 0.0));
  } else {
    jump(std::max(seconds, 0.0));
  }
  settle();
  raiseWhatWasThrown();
}

template <class Platform>
void PacedDriver<Platform>::wait(double seconds) {
  PacedClock::Going going(clock_, seconds);
  toolkit_.parts().runLoop.wake();
  while (!going.isOver() && !thrown_) awaitEvents(going.left());
  if (thrown_) return;
  toolkit_.parts().runLoop.wake();
  going.finish();
}

// Handles events between two firings, as happens when real time passes.
template <class Platform>
void PacedDriver<Platform>::jump(double seconds) {
  auto& runLoop = toolkit_.parts().runLoop;
  const double end = clock_.now() + seconds;
  double next = 0;
  do {
    const auto due = runLoop.isInDefaultMode() ? runLoop.nextDue() : end;
    next = std::min(due.value_or(end), end);
    clock_.reach(next);
    runLoop.wake();
    settle();
  } while (next < end && !thrown_);
}

template <class Platform>
void PacedDriver<Platform>::handOver(const std::function<void(const Ref<View>&)>& willAct,
                                     const std::function<bool()>& goesOn) {
  const auto desk = toolkit_.application().desk();
  desk->willAct = [&](const Ref<View>& view) {
    clock_.reach(clock_.horizon());  // timers that the action schedules start at this moment
    willAct(view);
  };
  const struct Quiet {
    decltype(desk) acting;
    ~Quiet() { acting->willAct = nullptr; }
  } atTheEnd{desk};

  const PacedClock::Going going(clock_, std::numeric_limits<double>::max());
  toolkit_.parts().runLoop.wake();
  while (goesOn()) {
    awaitEvents(going.left());
    raiseWhatWasThrown();
  }
}

}  // namespace qz::drivers
