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

/// A view that counts actions that reach it.
@interface QZFactView : NSView {
 @public
  int count;
}
- (void)count:(id)sender;
@end

@implementation QZFactView

- (BOOL)acceptsFirstResponder {
  return YES;
}

- (void)count:(id)sender {
  (void)sender;
  ++count;
}

@end

/// Understands an action that it has no method for.
@interface QZFactForwarder : NSObject {
 @public
  int forwarded;
}
@end

// By its name: in GCC's runtime one name can have several selectors.
static BOOL isCount(SEL selector) { return [NSStringFromSelector(selector) isEqual:@"count:"]; }

@implementation QZFactForwarder

- (BOOL)respondsToSelector:(SEL)selector {
  return isCount(selector) || [super respondsToSelector:selector];
}

- (NSMethodSignature*)methodSignatureForSelector:(SEL)selector {
  if ([super respondsToSelector:selector]) return [super methodSignatureForSelector:selector];
  return [NSMethodSignature signatureWithObjCTypes:"v@:@"];
}

- (void)forwardInvocation:(NSInvocation*)invocation {
  if (isCount([invocation selector])) ++forwarded;
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
  QZFactCounter* counter_ = [[[QZFactCounter alloc] init] autorelease];
};

template <class ViewClass>
ViewClass* newView(const NSRect& frame = NSMakeRect(0, 0, 90, 90)) {
  return [[[ViewClass alloc] initWithFrame:frame] autorelease];
}

/// Returns a timer that counts, in a mode of the run loop.
NSTimer* timerIn(NSString* mode, double interval, bool repeats, QZFactCounter* counter) {
  NSTimer* const timer = [NSTimer timerWithTimeInterval:interval
                                                 target:counter
                                               selector:@selector(count:)
                                               userInfo:nil
                                                repeats:repeats];
  [[NSRunLoop currentRunLoop] addTimer:timer forMode:mode];
  return timer;
}

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
  NSView* const view = newView<NSView>();
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
  [[window_ contentView] addSubview:newView<NSView>()];
  [[window_ contentView] addSubview:button_];
  EXPECT_EQ([[[window_ contentView] subviews] lastObject], button_);
  EXPECT_EQ([button_ superview], [window_ contentView]);
  EXPECT_EQ([button_ window], window_);
}

TEST_F(AppKitFacts, ABoxHoldsItsSubviewsInItsContentView) {
  NSBox* const box = newView<NSBox>();
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
  [button_ setEnabled:NO];
  EXPECT_TRUE([button_ sendAction:@selector(count:) to:counter_]);
  EXPECT_EQ(counter_->count, 1);
}

TEST_F(AppKitFacts, AnObjectMayForwardTheActionsThatItClaimsToUnderstand) {
  QZFactForwarder* const target = [[[QZFactForwarder alloc] init] autorelease];
  EXPECT_TRUE([button_ sendAction:@selector(count:) to:target]);
  EXPECT_EQ(target->forwarded, 1);
}

TEST_F(AppKitFacts, AnActionWithoutATargetGoesUpFromTheFirstResponder) {
  QZFactView* const outer = newView<QZFactView>();
  NSView* const inner = newView<NSTextField>();
  [outer addSubview:inner];
  [[window_ contentView] addSubview:outer];
  [window_ makeKeyAndOrderFront:nil];
  [window_ makeFirstResponder:inner];
  EXPECT_TRUE([NSApp sendAction:@selector(count:) to:nil from:button_]);
  EXPECT_EQ(outer->count, 1);
}

TEST_F(AppKitFacts, AnActionThatNoViewUnderstandsGoesToTheDelegateOfTheWindow) {
  [window_ setDelegate:static_cast<id>(counter_)];
  [window_ makeKeyAndOrderFront:nil];
  EXPECT_TRUE([NSApp sendAction:@selector(count:) to:nil from:button_]);
  EXPECT_EQ(counter_->count, 1);
  [window_ setDelegate:nil];
  EXPECT_FALSE([NSApp sendAction:@selector(count:) to:nil from:button_]);
}

TEST_F(AppKitFacts, AViewBesideTheContentViewTakesTheMouse) {
  NSView* const content = [window_ contentView];
  [content addSubview:button_];
  NSView* const around = [content superview];
  const NSPoint inButton = [button_ convertPoint:NSMakePoint(45, 15) toView:nil];
  EXPECT_EQ([around hitTest:inButton], button_);
  QZFactView* const cover = newView<QZFactView>([content frame]);
  [around addSubview:cover positioned:NSWindowAbove relativeTo:content];
  EXPECT_EQ([around hitTest:inButton], cover);
  EXPECT_EQ([window_ contentView], content);
  [cover removeFromSuperview];
  EXPECT_EQ([around hitTest:inButton], button_);
}

TEST_F(AppKitFacts, AWindowTellsItsObserversThatItCloses) {
  [[NSNotificationCenter defaultCenter] addObserver:counter_
                                           selector:@selector(count:)
                                               name:NSWindowWillCloseNotification
                                             object:window_];
  [window_ setReleasedWhenClosed:NO];
  [window_ makeKeyAndOrderFront:nil];
  [window_ orderOut:nil];
  EXPECT_EQ(counter_->count, 0);
  [window_ makeKeyAndOrderFront:nil];
  [window_ close];
  EXPECT_EQ(counter_->count, 1);
  EXPECT_FALSE([window_ isVisible]);
  [[NSNotificationCenter defaultCenter] removeObserver:counter_];
}

TEST_F(AppKitFacts, AWindowThatWasClosedCanBeShownAgain) {
  [window_ setReleasedWhenClosed:NO];
  [window_ makeKeyAndOrderFront:nil];
  [window_ close];
  [window_ makeKeyAndOrderFront:nil];
  EXPECT_TRUE([window_ isVisible]);
  [window_ orderOut:nil];
}

TEST_F(AppKitFacts, TheContentOfAWindowIsInItsFrame) {
  const NSRect content = [window_ contentRectForFrameRect:[window_ frame]];
  EXPECT_EQ(content.size.width, 200);
  EXPECT_EQ(content.size.height, 100);
}

TEST_F(AppKitFacts, AFieldWithAttributesHasTheirTextAsItsValue) {
  NSTextField* const field = newView<NSTextField>();
  NSDictionary* const red = [NSDictionary dictionaryWithObject:[NSColor redColor]
                                                        forKey:NSForegroundColorAttributeName];
  [field setAttributedStringValue:[[[NSAttributedString alloc] initWithString:@"Go"
                                                                   attributes:red] autorelease]];
  EXPECT_TRUE([[field stringValue] isEqual:@"Go"]);
}

TEST_F(AppKitFacts, AnImageIsFoundByTheNameThatItWasGiven) {
  NSImage* const image = [[[NSImage alloc] initWithSize:NSMakeSize(9, 9)] autorelease];
  EXPECT_TRUE([image setName:@"a fact"]);
  EXPECT_EQ([NSImage imageNamed:@"a fact"], image);
  [image setName:nil];
}

TEST_F(AppKitFacts, ATimerOfTheDefaultModeWaitsInOtherModes) {
  NSTimer* const timer = timerIn(NSDefaultRunLoopMode, 0.02, false, counter_);
  // A mode without a timer or port of its own returns at once.
  NSTimer* const other = timerIn(NSEventTrackingRunLoopMode, 10, false, counter_);
  runFor(0.1, NSEventTrackingRunLoopMode);
  EXPECT_EQ(counter_->count, 0);
  runFor(0.1, NSDefaultRunLoopMode);
  EXPECT_EQ(counter_->count, 1);
  EXPECT_FALSE([timer isValid]);
  [other invalidate];
}

TEST_F(AppKitFacts, ATimerCanBeMovedToAnEarlierDate) {
  NSTimer* const timer = timerIn(NSDefaultRunLoopMode, 1000, true, counter_);
  [timer setFireDate:[NSDate dateWithTimeIntervalSinceNow:0.02]];
  runFor(0.1, NSDefaultRunLoopMode);
  EXPECT_EQ(counter_->count, 1);
  EXPECT_TRUE([timer isValid]);
  [timer invalidate];
}

TEST_F(AppKitFacts, EachBooleanIsOneObjectAndNoOtherNumber) {
  EXPECT_EQ([NSNumber numberWithBool:YES], [NSNumber numberWithBool:YES]);
  EXPECT_EQ([NSNumber numberWithBool:NO], [NSNumber numberWithBool:NO]);
  EXPECT_NE([NSNumber numberWithChar:1], [NSNumber numberWithBool:YES]);
  EXPECT_NE([NSNumber numberWithInt:0], [NSNumber numberWithBool:NO]);
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
