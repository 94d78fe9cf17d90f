// SPDX-License-Identifier: MIT
// Facts of AppKit and Foundation that the toolkit relies on. Apart from the application object, the
// tests use nothing of the project's own, so that they run unchanged on a Mac. So far they have run
// on GNUstep only.

#import <AppKit/AppKit.h>
#include <gtest/gtest.h>

#include "qz/drivers/appkit/toolkit_row.hpp"
#include "qz/drivers/driver.hpp"
#import "tests/foundation/pool.hpp"

@interface QZFactCounter : NSObject {
 @public
  int count;
}
- (void)count:(id)sender;
@end

@implementation QZFactCounter

- (void)count:(id)sender {
  (void)sender;
  ++count;
}

@end

namespace {

class AppKitFacts : public qz::WithPool {
 protected:
  // Makes the application.
  const std::unique_ptr<qz::drivers::Driver> driver_ = qz::drivers::makeAppkitDriver();
  NSWindow* window_ =
      [[[NSWindow alloc] initWithContentRect:NSMakeRect(100, 100, 200, 100)
                                   styleMask:NSTitledWindowMask | NSClosableWindowMask
                                     backing:NSBackingStoreBuffered
                                       defer:YES] autorelease];
  NSButton* button_ = [[[NSButton alloc] initWithFrame:NSMakeRect(10, 10, 90, 30)] autorelease];
};

void runFor(double seconds, NSString* mode) {
  NSDate* const end = [NSDate dateWithTimeIntervalSinceNow:seconds];
  while ([end timeIntervalSinceNow] > 0) {
    [[NSRunLoop currentRunLoop] runMode:mode beforeDate:end];
  }
}

TEST_F(AppKitFacts, ANewButtonHasATitleAndTheTagZero) {
  EXPECT_TRUE([[button_ title] isEqual:@"Button"]);
  EXPECT_EQ([button_ tag], 0);
}

TEST_F(AppKitFacts, APlainViewHasATagThatCannotBeSet) {
  NSView* const view = [[[NSView alloc] initWithFrame:NSZeroRect] autorelease];
  EXPECT_EQ([view tag], -1);
  EXPECT_FALSE([view respondsToSelector:@selector(setTag:)]);
}

TEST_F(AppKitFacts, AButtonWithoutAMixedStateTurnsOnInstead) {
  [button_ setButtonType:NSSwitchButton];
  [button_ setState:NSMixedState];
  EXPECT_EQ([button_ state], NSOnState);
  [button_ setAllowsMixedState:YES];
  [button_ setState:NSMixedState];
  EXPECT_EQ([button_ state], NSMixedState);
}

TEST_F(AppKitFacts, AControlDoesNotRetainItsTarget) {
  QZFactCounter* const target = [[QZFactCounter alloc] init];
  [button_ setTarget:target];
  EXPECT_EQ([target retainCount], 1U);
  [button_ setTarget:nil];
  [target release];
}

TEST_F(AppKitFacts, AWindowDoesNotRetainItsDelegate) {
  QZFactCounter* const delegate = [[QZFactCounter alloc] init];
  [window_ setDelegate:static_cast<id>(delegate)];
  EXPECT_EQ([delegate retainCount], 1U);
  [window_ setDelegate:nil];
  [delegate release];
}

TEST_F(AppKitFacts, ASuperviewOwnsItsSubviewsFromBackToFront) {
  NSView* const first = [[[NSView alloc] initWithFrame:NSZeroRect] autorelease];
  [[window_ contentView] addSubview:first];
  [[window_ contentView] addSubview:button_];
  EXPECT_EQ([[[window_ contentView] subviews] lastObject], button_);
  EXPECT_EQ([button_ superview], [window_ contentView]);
  EXPECT_EQ([button_ window], window_);
}

TEST_F(AppKitFacts, ABoxHoldsItsSubviewsInItsContentView) {
  NSBox* const box = [[[NSBox alloc] initWithFrame:NSMakeRect(0, 0, 90, 90)] autorelease];
  [[box contentView] addSubview:button_];
  EXPECT_EQ([[button_ superview] superview], box);
}

TEST_F(AppKitFacts, HighlightingAButtonHighlightsItsCell) {
  [button_ highlight:YES];
  EXPECT_TRUE([[button_ cell] isHighlighted]);
  EXPECT_EQ([button_ state], NSOffState);
  [button_ highlight:NO];
  EXPECT_FALSE([[button_ cell] isHighlighted]);
}

TEST_F(AppKitFacts, AnActionGoesToItsTargetEvenFromADisabledButton) {
  QZFactCounter* const target = [[[QZFactCounter alloc] init] autorelease];
  [button_ setEnabled:NO];
  EXPECT_TRUE([button_ sendAction:@selector(count:) to:target]);
  EXPECT_EQ(target->count, 1);
}

TEST_F(AppKitFacts, ATimerOfTheDefaultModeWaitsInOtherModes) {
  QZFactCounter* const counter = [[[QZFactCounter alloc] init] autorelease];
  NSTimer* const timer = [NSTimer timerWithTimeInterval:0.02
                                                 target:counter
                                               selector:@selector(count:)
                                               userInfo:nil
                                                repeats:NO];
  [[NSRunLoop currentRunLoop] addTimer:timer forMode:NSDefaultRunLoopMode];
  // A mode without a timer or port of its own returns at once.
  NSTimer* const other = [NSTimer timerWithTimeInterval:10
                                                 target:counter
                                               selector:@selector(count:)
                                               userInfo:nil
                                                repeats:NO];
  [[NSRunLoop currentRunLoop] addTimer:other forMode:NSEventTrackingRunLoopMode];
  runFor(0.1, NSEventTrackingRunLoopMode);
  EXPECT_EQ(counter->count, 0);
  runFor(0.1, NSDefaultRunLoopMode);
  EXPECT_EQ(counter->count, 1);
  EXPECT_FALSE([timer isValid]);
  [other invalidate];
}

TEST_F(AppKitFacts, ATimerCanBeMovedToAnEarlierDate) {
  QZFactCounter* const counter = [[[QZFactCounter alloc] init] autorelease];
  NSTimer* const timer = [NSTimer timerWithTimeInterval:1000
                                                 target:counter
                                               selector:@selector(count:)
                                               userInfo:nil
                                                repeats:YES];
  [[NSRunLoop currentRunLoop] addTimer:timer forMode:NSDefaultRunLoopMode];
  [timer setFireDate:[NSDate dateWithTimeIntervalSinceNow:0.02]];
  runFor(0.1, NSDefaultRunLoopMode);
  EXPECT_EQ(counter->count, 1);
  EXPECT_TRUE([timer isValid]);
  [timer invalidate];
}

TEST_F(AppKitFacts, AMessageToNilAnswersZero) {
  NSButton* const none = nil;
  EXPECT_EQ([none tag], 0);
  EXPECT_EQ([none title], nil);
  EXPECT_EQ([[none cell] isHighlighted], NO);
}

TEST_F(AppKitFacts, APositionBeyondTheEndOfAnArrayRaises) {
  EXPECT_EQ(qz::raisedBy([] { [[NSArray array] objectAtIndex:0]; }).substr(0, 16),
            "NSRangeException");
}

}  // namespace
