// SPDX-License-Identifier: MIT
// Begins and ends walk-throughs many times; fails if anything is left behind.

#include <malloc.h>
#include <stdio.h>

#import "QZ_Plist_State_Parser.h"
#import "checks.h"

static NSInteger engines = 0;

@interface CountedEngine : QZ_Plist_State_Parser
@end

@implementation CountedEngine
- (id)initWithWindow:(NSWindow*)window {
  ++engines;
  return [super initWithWindow:window];
}
- (void)dealloc {
  --engines;
  [super dealloc];
}
@end

static void playOnce(NSWindow* window) {
  NSAutoreleasePool* pool = [[NSAutoreleasePool alloc] init];
  NSArray* list = command(@"SET_TEXT_FOR_OBJECT_ID", @"a", number(textTag));
  NSMutableDictionary* script = [NSMutableDictionary dictionaryWithObject:list forKey:@"2"];
  CountedEngine* engine = [[CountedEngine alloc] initWithWindow:nil];
  [engine getGuiAssetsFromWindow:window];
  [engine setPlistDictionary:script];
  [engine startTimerWithValue:100 forKey:@"9"];
  [[engine guiAssets] allValues];
  [[engine objectIdTimers] allValues];
  [controlIn(window, nextTag) performClick:nil];
  [engine terminateParser];
  [engine release];
  [pool release];
}

static void play(NSWindow* window, int times) {
  for (int i = 0; i < times; ++i) playOnce(window);
}

int main(void) {
  NSAutoreleasePool* pool = [[NSAutoreleasePool alloc] init];
  int times = 1000;
  [[NSApplication sharedApplication] finishLaunching];
  NSWindow* window = windowWithControls();
  play(window, 20);  // fills the caches
  size_t before = mallinfo2().uordblks;
  play(window, times);
  size_t after = mallinfo2().uordblks;
  long each = ((long)after - (long)before) / times;
  printf("%d walk-throughs: %ld bytes left by each\n", times, each);
  CHECK(engines == 0);
  CHECK(each < 16);
  [pool release];
  return testResult();
}
