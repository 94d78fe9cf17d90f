// SPDX-License-Identifier: MIT
// The two operations that timers call always go through the object, which then notices what the
// host has changed since the last call.

#import "hosts/appkit/derived_class.hpp"

#include <string>
#include <type_traits>

#import "hosts/appkit/engine_timers.hpp"
#import "toolkit/foundation/exceptions.hpp"
#import "toolkit/foundation/kept.hpp"
#import "toolkit/foundation/strings.hpp"
#import "toolkit/foundation/values.hpp"

namespace qz::hosts::appkit {

namespace {

bool isCalledByTimers(std::string_view operation) {
  return operation == "flasherFired:" || operation == "pseudoButtonPush:";
}

SEL selectorNamed(std::string_view operation) {
  return NSSelectorFromString(toolkit::foundation::nsString(operation));
}

/// Sets the arguments of an invocation, in order.
class ArgumentSetter {
 public:
  ArgumentSetter(NSInvocation* invocation, Platform& platform)
      : invocation_(invocation), platform_(platform) {}

  void operator()(bool flag) { set(static_cast<BOOL>(flag)); }
  void operator()(std::uint64_t number) { set(static_cast<NSUInteger>(number)); }
  void operator()(toolkit::Tag tag) { set(static_cast<NSInteger>(tag)); }
  void operator()(const toolkit::ValueRef<>& value) { set(toolkit::foundation::objectOf(value)); }
  void operator()(const toolkit::Ref<toolkit::View>& view) { set(platform_.object(view)); }
  void operator()(const toolkit::Ref<toolkit::Window>& window) { set(platform_.object(window)); }
  void operator()(const toolkit::Ref<toolkit::Timer>& timer) { set<id>(objectOf(timer)); }

 private:
  template <class T>
  void set(T argument) {
    [invocation_ setArgument:&argument atIndex:next_++];
  }

  NSInvocation* invocation_;
  Platform& platform_;
  NSInteger next_ = 2;  // after the object and the selector
};

Subclass::Result resultOf(NSInvocation* invocation, Platform& platform) {
  switch (*[[invocation methodSignature] methodReturnType]) {
    case 'v':
      return {};
    case '@': {
      id object = nil;
      [invocation getReturnValue:&object];
      return {.yes = false, .control = platform.view(object)};
    }
    default: {
      BOOL yes = NO;
      [invocation getReturnValue:&yes];
      return {.yes = yes != NO, .control = {}};
    }
  }
}

}  // namespace

DerivedClass::DerivedClass(id object, Class baseClass, Platform& platform)
    : object_(object),
      baseClass_(baseClass),
      platform_(platform),
      isBaseClass_([object class] == baseClass) {}

bool DerivedClass::overrides(std::string_view operation) {
  if (!object_) return false;
  if (own_ && operation == sel_getName(own_)) {
    own_ = nullptr;
    return false;
  }
  return isCalledByTimers(operation) || (!isBaseClass_ && isOverridden(operation));
}

bool DerivedClass::isOverridden(std::string_view operation) {
  const auto known = overridden_.find(operation);
  if (known != overridden_.end()) return known->second;
  const SEL selector = selectorNamed(operation);
  const bool isOther =
      [object_ methodForSelector:selector] != [baseClass_ instanceMethodForSelector:selector];
  overridden_.emplace(sel_getName(selector), isOther);
  return isOther;
}

Subclass::Result DerivedClass::perform(std::string_view operation,
                                       std::span<const Argument> arguments) {
  const toolkit::foundation::Kept<id> kept(object_);
  Platform& platform = platform_;
  const toolkit::foundation::Pool pool;  // outside `sending`, which reads what was raised
  return toolkit::foundation::sending([&] {
    const SEL selector = selectorNamed(operation);
    NSInvocation* const invocation = [NSInvocation
        invocationWithMethodSignature:[kept.get() methodSignatureForSelector:selector]];
    [invocation setSelector:selector];
    ArgumentSetter setter(invocation, platform);
    for (const Argument& argument : arguments) std::visit(setter, argument);
    [invocation invokeWithTarget:kept.get()];
    return resultOf(invocation, platform);
  });
}

std::shared_ptr<void> DerivedClass::object() {
  return std::shared_ptr<void>([object_ retain],
                               [](void* object) { [static_cast<id>(object) release]; });
}

}  // namespace qz::hosts::appkit
