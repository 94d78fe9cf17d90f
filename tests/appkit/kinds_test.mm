// SPDX-License-Identifier: MIT
// The kinds of view on AppKit.

#include <gtest/gtest.h>

#import "drivers/appkit/appkit_driver.hpp"
#include "qz/drivers/appkit/toolkit_row.hpp"
#include "qz/toolkit/exception.hpp"
#import "tests/foundation/pool.hpp"
#include "tests/view_kinds.hpp"

namespace qz::toolkit::appkit {
namespace {

class AppKitViews : public WithPool {
 protected:
  const std::unique_ptr<drivers::Driver> driver_ = drivers::makeAppkitDriver();
  AppKitApplication& application_ =
      static_cast<AppKitApplication&>(driver_->toolkit().application());
};

NSButton* newButton() {
  return [[[NSButton alloc] initWithFrame:NSMakeRect(10, 10, 90, 30)] autorelease];
}

TEST_F(AppKitViews, HaveEveryKind) { expectEveryKindOfView(*driver_); }

TEST_F(AppKitViews, AreTheSameEachTime) {
  NSButton* const button = newButton();
  const auto view = application_.view(button);
  EXPECT_EQ(application_.view(button), view);
  EXPECT_EQ(application_.object(view), button);
  EXPECT_FALSE(application_.view(nil));
  EXPECT_FALSE(application_.window(nil));
}

TEST_F(AppKitViews, RaiseWhatAppKitWouldRaise) {
  NSView* const plain = [[[NSView alloc] initWithFrame:NSZeroRect] autorelease];
  const auto view = application_.view(plain);
  EXPECT_THROW(view->setTag(5), InvalidArgumentException);
  EXPECT_THROW(view->setStringValue("x"), InvalidArgumentException);
  EXPECT_NO_THROW(view->setToolTip("x"));
}

TEST_F(AppKitViews, OfOtherControlsUnderstandWhatControlsDo) {
  NSSlider* const slider = [[[NSSlider alloc] initWithFrame:NSMakeRect(0, 0, 90, 20)] autorelease];
  const auto view = application_.view(slider);
  view->setEnabled(false);
  EXPECT_FALSE([slider isEnabled]);
  view->setStringValue("1");
  EXPECT_EQ([slider intValue], 1);
  EXPECT_EQ(view->asButton(), nullptr);
}

TEST_F(AppKitViews, ReadAPlainTitleOfTheHostWithoutAttributes) {
  NSButton* const button = newButton();
  [button setTitle:@"Go"];
  const auto view = application_.view(button);
  EXPECT_EQ(view->attributedTitle(), AttributedString("Go"));
  [button setTitle:@"Stop"];
  EXPECT_EQ(view->attributedTitle(), AttributedString("Stop"));
}

TEST_F(AppKitViews, ShowAStyledTitle) {
  NSButton* const button = newButton();
  const auto view = application_.view(button);
  view->setAttributedTitle(AttributedString("Go", {.foregroundColor = colors::red}));
  NSDictionary* const attributes = [[button attributedTitle] attributesAtIndex:0
                                                                effectiveRange:NULL];
  NSColor* const color = [[attributes objectForKey:NSForegroundColorAttributeName]
      colorUsingColorSpaceName:NSCalibratedRGBColorSpace];
  EXPECT_EQ([color redComponent], 1);
  EXPECT_EQ([color blueComponent], 0);
  EXPECT_NE([attributes objectForKey:NSFontAttributeName], nil);
}

TEST_F(AppKitViews, LeaveNoTargetBehind) {
  struct Host final : Responder {};
  NSButton* const button = newButton();
  const auto host = std::make_shared<Host>();
  auto view = asButton(application_.view(button));
  view->setTarget(host);
  EXPECT_NE([button target], nil);
  view = {};
  EXPECT_EQ([button target], nil);
}

TEST_F(AppKitViews, GoWithTheirWindowAndTheirHost) {
  std::weak_ptr<View> button;
  {
    const auto window = driver_->makeWindow({0, 0, 200, 100});
    button =
        driver_->makeView(drivers::ViewKind::button, 1, {10, 10, 90, 30}, window->contentView())
            .pointer();
    EXPECT_FALSE(button.expired());
  }
  EXPECT_TRUE(button.expired());
}

}  // namespace
}  // namespace qz::toolkit::appkit
