// SPDX-License-Identifier: MIT
// The tables below do not keep their objects alive: an entry goes when its object does. Every
// release of an object in `objects` holds the lock, so that no other thread finds one that is being
// deallocated.

#import "hosts/appkit/engine_timers.hpp"

#include <algorithm>
#include <memory>
#include <mutex>
#include <unordered_map>

#import "hosts/appkit/arguments.hpp"
#import "toolkit/foundation/exceptions.hpp"
#import "toolkit/foundation/kept.hpp"

using qz::toolkit::Ref;
using qz::toolkit::Timer;

/// A timer of the engine. The platform schedules it: it is not in an `NSRunLoop` itself.
@interface QZEngineTimer : NSTimer {
 @private
  Ref<Timer>* timer_;  // owned
}
- (id)initWithTimer:(const Ref<Timer>&)timer;
- (Ref<Timer>)timer;
@end

namespace qz::hosts::appkit {

namespace {

using toolkit::foundation::sending;

class HostTimer;

struct KnownTimers {
  std::recursive_mutex mutex;
  std::unordered_map<const Timer*, QZEngineTimer*> objects;
  std::unordered_map<NSTimer*, std::weak_ptr<HostTimer>> hostTimers;
};

// Never destroyed: timers may be released while the program exits.
KnownTimers& known() {
  static auto& timers = *new KnownTimers;
  return timers;
}

using Lock = std::lock_guard<std::recursive_mutex>;

/// A host's `NSTimer`.
class HostTimer final : public Timer {
 public:
  explicit HostTimer(NSTimer* timer) : object_(timer) {}
  ~HostTimer() override {
    const Lock lock(known().mutex);
    known().hostTimers.erase(object());
  }
  HostTimer(const HostTimer&) = delete;
  HostTimer& operator=(const HostTimer&) = delete;

  NSTimer* object() const { return object_.get(); }
  bool isValid() const override {
    return sending([&] { return static_cast<bool>([object() isValid]); });
  }
  void invalidate() override {
    sending([&] { [object() invalidate]; });
  }
  double interval() const override {
    return sending([&] { return [object() timeInterval]; });
  }
  double timeLeft() const override {
    return sending([&] {
      return [object() isValid] ? std::max(0.0, [[object() fireDate] timeIntervalSinceNow]) : 0.0;
    });
  }

 private:
  toolkit::foundation::Kept<NSTimer*> object_;
};

}  // namespace

NSTimer* objectOf(const Ref<Timer>& timer) {
  if (!timer) return nil;
  if (const auto host = std::dynamic_pointer_cast<HostTimer>(timer.pointer())) {
    return [[host->object() retain] autorelease];
  }
  const Lock lock(known().mutex);
  QZEngineTimer*& object = known().objects[timer.pointer().get()];
  return object ? [[object retain] autorelease]
                : [(object = [[QZEngineTimer alloc] initWithTimer:timer]) autorelease];
}

Ref<Timer> timerOf(id object) {
  if (!object) return {};
  if ([object isKindOfClass:[QZEngineTimer class]]) return [object timer];
  requireKind(object, [NSTimer class]);
  const Lock lock(known().mutex);
  auto& entry = known().hostTimers[object];
  auto host = entry.lock();
  if (!host) entry = host = std::make_shared<HostTimer>(object);
  return host;
}

}  // namespace qz::hosts::appkit

using qz::hosts::appkit::known;
using qz::hosts::appkit::Lock;

@implementation QZEngineTimer

// Does not call the initialiser of NSTimer, which would schedule it.
- (id)initWithTimer:(const Ref<Timer>&)timer {
  timer_ = new Ref<Timer>(timer);
  return self;
}

- (oneway void)release {
  const Lock lock(known().mutex);
  [super release];
}

- (void)dealloc {
  known().objects.erase(timer_->pointer().get());
  delete timer_;
  timer_ = nullptr;  // NSTimer invalidates itself when it is deallocated
  [super dealloc];
}

- (Ref<Timer>)timer {
  return *timer_;
}

- (BOOL)isValid {
  return (*timer_)->isValid();
}

- (void)invalidate {
  if (timer_) (*timer_)->invalidate();
}

- (NSTimeInterval)timeInterval {
  return (*timer_)->interval();
}

- (NSDate*)fireDate {
  return [NSDate dateWithTimeIntervalSinceNow:(*timer_)->timeLeft()];
}

- (void)setFireDate:(NSDate*)date {
  (void)date;
  [NSException raise:NSInvalidArgumentException format:@"a timer of the engine cannot be moved"];
}

- (void)fire {
  [NSException raise:NSInvalidArgumentException format:@"a timer of the engine fires by itself"];
}

- (id)userInfo {
  return nil;
}

@end
