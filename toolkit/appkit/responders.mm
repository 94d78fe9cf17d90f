// SPDX-License-Identifier: MIT
// A responder of C++ cannot be asked which actions it understands. Its object therefore claims to
// understand every action that a control of the toolkit has had, and none of a delegate's messages.

#import "toolkit/appkit/responders.hpp"

#include <string>
#include <unordered_set>

#import "toolkit/appkit/calling.hpp"
#import "toolkit/appkit/view_node.hpp"
#import "toolkit/foundation/strings.hpp"

namespace qz::toolkit::appkit {

namespace {

std::unordered_set<std::string>& knownActions() {
  static auto& actions = *new std::unordered_set<std::string>;
  return actions;
}

std::string nameOf(SEL selector) {
  const foundation::Pool pool;
  return foundation::utf8(NSStringFromSelector(selector));
}

struct ResponderPlace {
  std::weak_ptr<Responder> responder;  // kept alive by its owner
  std::weak_ptr<Desk> desk;
};

// An exception must not pass through AppKit's event loop; the desk's calls handle it.
void perform(const ResponderPlace& place, SEL selector, id sender) {
  const auto responder = place.responder.lock();
  const auto desk = place.desk.lock();
  if (!desk) return;
  const Ref<View> view =
      [sender isKindOfClass:[NSView class]] ? desk->nodeOf(sender)->view() : Ref<View>();
  if (desk->willAct) desk->willAct(view);
  desk->calls.make([&] {
    calling([&] {
      if (responder) {
        responder->tryToPerform(nameOf(selector), view);
      } else {
        [NSApp sendAction:selector to:nil from:sender];
      }
    });
  });
}

}  // namespace

}  // namespace qz::toolkit::appkit

using qz::toolkit::appkit::ResponderPlace;

@interface QZResponderObject : NSObject {
 @private
  ResponderPlace* place_;
}
- (id)initWithPlace:(const ResponderPlace&)place;
- (std::shared_ptr<qz::toolkit::Responder>)responder;
@end

@implementation QZResponderObject

- (id)initWithPlace:(const ResponderPlace&)place {
  self = [super init];
  place_ = new ResponderPlace(place);
  return self;
}

- (void)dealloc {
  delete place_;
  [super dealloc];
}

- (std::shared_ptr<qz::toolkit::Responder>)responder {
  return place_->responder.lock();
}

- (BOOL)respondsToSelector:(SEL)selector {
  return [super respondsToSelector:selector] ||
         qz::toolkit::appkit::knownActions().count(qz::toolkit::appkit::nameOf(selector)) > 0;
}

- (NSMethodSignature*)methodSignatureForSelector:(SEL)selector {
  if ([super respondsToSelector:selector]) return [super methodSignatureForSelector:selector];
  return [NSMethodSignature signatureWithObjCTypes:"v@:@"];
}

- (void)forwardInvocation:(NSInvocation*)invocation {
  id sender = nil;
  [invocation getArgument:&sender atIndex:2];
  [[self retain] autorelease];
  qz::toolkit::appkit::perform(*place_, [invocation selector], sender);
}

@end

namespace qz::toolkit::appkit {

namespace {

/// A host's own object, which is not kept alive: like AppKit, this relies on its owner.
class ForeignResponder final : public Responder {
 public:
  explicit ForeignResponder(id object) : object_(object) {}

  bool tryToPerform(std::string_view action, const Ref<View>& sender) override {
    const SEL selector = selectorOf(action);
    const auto node = ViewNode::of(sender);
    return calling([&] {
      if (![object_ respondsToSelector:selector]) return false;
      [object_ performSelector:selector withObject:node ? node->object() : nil];
      return true;
    });
  }

 private:
  id object_;
};

}  // namespace

Stand::Stand(const std::shared_ptr<Responder>& responder, const std::shared_ptr<Desk>& desk) {
  if (!responder) return;
  object_ = desk->objectFor(responder.get());
  if (object_) return;
  own_ = foundation::Kept<id>::adopt(
      [[QZResponderObject alloc] initWithPlace:ResponderPlace{responder, desk}]);
  object_ = own_.get();
}

std::shared_ptr<Responder> responderFor(id object, const std::shared_ptr<Desk>& desk) {
  if (!object) return nullptr;
  if ([object isKindOfClass:[QZResponderObject class]]) return [object responder];
  if (auto known = desk->responderOf(object)) return known;
  return std::make_shared<ForeignResponder>(object);
}

SEL selectorOf(std::string_view action) {
  if (action.empty()) return nullptr;
  const foundation::Pool pool;
  knownActions().emplace(action);
  return NSSelectorFromString(foundation::nsString(action));
}

}  // namespace qz::toolkit::appkit
