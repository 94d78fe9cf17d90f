// SPDX-License-Identifier: MIT
// Presses, targets and delegates on AppKit: what scenarios cannot see.

#include <gtest/gtest.h>

#include <functional>
#include <string>

#import "drivers/appkit/appkit_driver.hpp"
#include "qz/drivers/appkit/toolkit_row.hpp"
#include "qz/engine.hpp"
#include "qz/toolkit/exception.hpp"
#import "tests/foundation/pool.hpp"

/// A host's own object.
@interface QZTestHost : NSObject {
 @public
  int pressed;
  id sender;
}
- (void)pressed:(id)from;
@end

@implementation QZTestHost

- (void)pressed:(id)from {
  ++pressed;
  sender = from;
}

@end

namespace qz::toolkit::appkit {
namespace {

using drivers::ViewKind;

class Watcher final : public Responder {
 public:
  bool tryToPerform(std::string_view action, const Ref<View>& sender) override {
    performed += action;
    if (then) then(sender);
    return true;
  }
  std::string performed;
  std::function<void(const Ref<View>&)> then;
};

class AppKitPresses : public WithPool {
 protected:
  Ref<Button> button(Tag tag = 1) {
    return asButton(
        driver_->makeView(ViewKind::button, tag, {10, 10, 90, 30}, window_->contentView()));
  }

  const std::unique_ptr<drivers::Driver> driver_ = drivers::makeAppkitDriver();
  AppKitApplication& application_ =
      static_cast<AppKitApplication&>(driver_->toolkit().application());
  Ref<Window> window_ = driver_->makeWindow({0, 0, 200, 100});
};

TEST_F(AppKitPresses, ReachAHostsOwnObject) {
  QZTestHost* const host = [[[QZTestHost alloc] init] autorelease];
  const auto view = button();
  NSButton* const object = static_cast<NSButton*>(application_.object(view));
  [object setTarget:host];
  [object setAction:@selector(pressed:)];
  driver_->click(view);
  EXPECT_EQ(host->pressed, 1);
  EXPECT_EQ(host->sender, object);
  const auto target = driver_->look(view).target;
  ASSERT_NE(target, nullptr);
  EXPECT_TRUE(target->tryToPerform("pressed:", view));
  EXPECT_EQ(host->pressed, 2);
  EXPECT_FALSE(target->tryToPerform("other:", view));
}

TEST_F(AppKitPresses, ReachTheObjectThatStandsForAResponder) {
  QZTestHost* const host = [[[QZTestHost alloc] init] autorelease];
  const auto responder = std::make_shared<Watcher>();
  application_.present(responder, host);
  const auto view = button();
  view->setTarget(responder);
  view->setAction("pressed:");
  EXPECT_EQ([static_cast<NSButton*>(application_.object(view)) target], host);
  EXPECT_EQ(driver_->look(view).target, responder);
  driver_->click(view);
  EXPECT_EQ(host->pressed, 1);
  EXPECT_EQ(responder->performed, "");
}

TEST_F(AppKitPresses, KeepADelegateOfTheHost) {
  QZTestHost* const host = [[[QZTestHost alloc] init] autorelease];
  [application_.object(window_) setDelegate:static_cast<id>(host)];
  EXPECT_NE(window_->delegate(), nullptr);
  [application_.object(window_) setDelegate:nil];
  EXPECT_EQ(window_->delegate(), nullptr);
}

TEST_F(AppKitPresses, MayCloseTheWindow) {
  const auto watcher = std::make_shared<Watcher>();
  const auto view = button();
  view->setTarget(watcher);
  view->setAction("done:");
  watcher->then = [this](const Ref<View>&) {
    window_->close();
    window_ = {};
  };
  driver_->click(view);
  EXPECT_EQ(watcher->performed, "done:");
}

TEST_F(AppKitPresses, MayRemoveTheButton) {
  const auto watcher = std::make_shared<Watcher>();
  std::weak_ptr<View> seen;
  {
    const auto view = button();
    seen = view.pointer();
    view->setTarget(watcher);
    view->setAction("done:");
    watcher->then = [this](const Ref<View>& sender) { driver_->removeFromSuperview(sender); };
    driver_->click(view);
  }
  EXPECT_EQ(watcher->performed, "done:");
  EXPECT_TRUE(seen.expired());
}

TEST_F(AppKitPresses, MayReleaseTheirTarget) {
  auto watcher = std::make_shared<Watcher>();
  const auto view = button();
  view->setTarget(watcher);
  view->setAction("done:");
  watcher->then = [&](const Ref<View>&) { watcher.reset(); };
  driver_->click(view);
  EXPECT_EQ(watcher, nullptr);
  driver_->click(view);
}

TEST_F(AppKitPresses, LetExceptionsReachTheDriver) {
  const auto watcher = std::make_shared<Watcher>();
  const auto view = button();
  view->setTarget(watcher);
  view->setAction("done:");
  watcher->then = [](const Ref<View>&) { throw RangeException("far"); };
  EXPECT_THROW(driver_->click(view), RangeException);
  watcher->then = [](const Ref<View>&) { [NSException raise:NSRangeException format:@"farther"]; };
  EXPECT_THROW(driver_->click(view), Exception);
}

TEST_F(AppKitPresses, LeaveNothingBehindAfterManyWalkThroughs) {
  const NSUInteger windows = [[NSApp windows] count];
  std::weak_ptr<QZ_Plist_State_Parser> last;
  std::weak_ptr<View> control;
  for (int i = 0; i < 100; ++i) {
    const foundation::Pool pool;
    const Ref<Window> window = driver_->makeWindow({0, 0, 200, 100});
    const auto view =
        driver_->makeView(ViewKind::button, 1, {10, 10, 90, 30}, window->contentView());
    const auto engine = QZ_Plist_State_Parser::initWithWindow(driver_->toolkit(), window_);
    engine->getGuiAssetsFromWindow(window);
    driver_->click(view);
    engine->terminateParser();
    last = engine;
    control = view.pointer();
  }
  driver_->advance(0);
  EXPECT_TRUE(last.expired());
  EXPECT_TRUE(control.expired());
  EXPECT_LE([[NSApp windows] count], windows + 1);
}

}  // namespace
}  // namespace qz::toolkit::appkit
