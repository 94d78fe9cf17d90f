// SPDX-License-Identifier: MIT
// Moves the date of the single `NSTimer`.

#import "toolkit/appkit/run_loop.hpp"

#include <algorithm>
#include <utility>

#import "toolkit/appkit/calling.hpp"

using qz::toolkit::appkit::AppKitRunLoop;

/// The target of the `NSTimer`, which retains it.
@interface QZWakener : NSObject {
 @private
  AppKitRunLoop* loop_;  // its owner; null once that has ended
}
- (id)initWithLoop:(AppKitRunLoop*)loop;
- (void)forgetLoop;
- (void)wake:(NSTimer*)timer;
@end

@implementation QZWakener

- (id)initWithLoop:(AppKitRunLoop*)loop {
  self = [super init];
  loop_ = loop;
  return self;
}

- (void)forgetLoop {
  loop_ = nullptr;
}

- (void)wake:(NSTimer*)timer {
  (void)timer;
  if (loop_) loop_->wake();
}

@end

namespace qz::toolkit::appkit {

namespace {

// In seconds. A fire date must be a date; longer waits consist of several of these.
constexpr double longestWait = 24 * 60 * 60;

}  // namespace

AppKitRunLoop::AppKitRunLoop(Clock& clock, Calls& calls) : clock_(clock), calls_(calls) {
  const foundation::Pool pool;
  wakener_ = foundation::Kept<id>::adopt([[QZWakener alloc] initWithLoop:this]);
  // Repeats, so that it stays valid; `setAlarm` moves its date.
  alarm_ = foundation::Kept<NSTimer*>([NSTimer timerWithTimeInterval:longestWait
                                                              target:wakener_.get()
                                                            selector:@selector(wake:)
                                                            userInfo:nil
                                                             repeats:YES]);
  [[NSRunLoop currentRunLoop] addTimer:alarm_.get() forMode:NSDefaultRunLoopMode];
}

AppKitRunLoop::~AppKitRunLoop() {
  const foundation::Pool pool;
  [wakener_.get() forgetLoop];
  [alarm_.get() invalidate];
  invalidateAll();
}

Ref<Timer> AppKitRunLoop::schedule(double interval, bool repeats, TimerAction action) {
  auto timer = TimedRunLoop::schedule(interval, repeats, std::move(action));
  setAlarm();
  return timer;
}

// GNUstep sees only by its address that an action has moved the date, so the old date must live
// until then.
void AppKitRunLoop::wake() {
  const foundation::Kept<NSDate*> old([alarm_.get() fireDate]);
  calls_.make([this] { calling([this] { fireDue(clock_.horizon()); }); });
  setAlarm();
}

// A firing timer may run its own event loop, in which the other timers must fire.
void AppKitRunLoop::reach(double due) {
  clock_.reach(due);
  setAlarm();
}

void AppKitRunLoop::setAlarm() {
  const foundation::Pool pool;
  if (![alarm_.get() isValid]) return;  // the toolkit ends
  const auto due = userIsBusy_ ? std::nullopt : nextDue();
  const double wait =
      std::clamp(due.value_or(clock_.now() + longestWait) - clock_.horizon(), 0.0, longestWait);
  [alarm_.get() setFireDate:[NSDate dateWithTimeIntervalSinceNow:wait]];
}

}  // namespace qz::toolkit::appkit
