// SPDX-License-Identifier: MIT
#import "checks.h"

#include <stdio.h>

static int failures = 0;

void checkThat(BOOL holds, const char* what, const char* file, int line) {
  if (holds) return;
  ++failures;
  fprintf(stderr, "%s:%d: failed: %s\n", file, line, what);
}

void checkEqual(id object, id expected, const char* what, const char* file, int line) {
  if (object == expected || [object isEqual:expected]) return;
  checkThat(NO, what, file, line);
  fprintf(stderr, "  is %s, expected %s\n", [[object description] UTF8String],
          [[expected description] UTF8String]);
}

void checkRaised(NSException* raised, NSString* name, NSString* text, const char* what,
                 const char* file, int line) {
  BOOL contains = [text length] == 0 || [[raised reason] rangeOfString:text].length > 0;
  BOOL holds = [[raised name] isEqual:name] && contains;
  checkThat(holds, what, file, line);
  if (!holds) {
    fprintf(stderr, "  raised %s: %s\n", [[raised name] UTF8String], [[raised reason] UTF8String]);
  }
}

void runTest(const char* name, void (*test)(void)) {
  NSAutoreleasePool* pool = [[NSAutoreleasePool alloc] init];
  printf("%s\n", name);
  fflush(stdout);
  test();
  [pool release];
}

int testResult(void) {
  printf("%d failures\n", failures);
  return failures == 0 ? 0 : 1;
}

static void add(NSWindow* window, NSView* view) {
  [[window contentView] addSubview:view];
  [view release];
}

NSWindow* windowWithControls(void) {
  NSWindow* window = [[NSWindow alloc] initWithContentRect:NSMakeRect(100, 100, 300, 200)
                                                 styleMask:3
                                                   backing:NSBackingStoreBuffered
                                                     defer:YES];
  [window setReleasedWhenClosed:NO];
  NSButton* next = [[NSButton alloc] initWithFrame:NSMakeRect(200, 10, 80, 30)];
  [next setTag:nextTag];
  add(window, next);
  NSButton* onOff = [[NSButton alloc] initWithFrame:NSMakeRect(10, 10, 80, 30)];
  [onOff setButtonType:NSSwitchButton];
  [onOff setTag:switchTag];
  add(window, onOff);
  NSTextField* text = [[NSTextField alloc] initWithFrame:NSMakeRect(10, 100, 200, 30)];
  [text setTag:textTag];
  add(window, text);
  NSImageView* image = [[NSImageView alloc] initWithFrame:NSMakeRect(220, 100, 60, 60)];
  [image setTag:imageTag];
  add(window, image);
  NSTextView* plain = [[NSTextView alloc] initWithFrame:NSMakeRect(10, 150, 60, 20)];
  add(window, plain);
  return [window autorelease];
}

id controlIn(NSWindow* window, NSInteger tag) { return [[window contentView] viewWithTag:tag]; }

NSString* scriptFile(NSDictionary* script) {
  static int count = 0;
  NSString* name = [NSString
      stringWithFormat:@"qz-%d-%d.plist", [[NSProcessInfo processInfo] processIdentifier], ++count];
  NSString* path = [NSTemporaryDirectory() stringByAppendingPathComponent:name];
  NSData* data = [NSPropertyListSerialization dataFromPropertyList:script
                                                            format:NSPropertyListXMLFormat_v1_0
                                                  errorDescription:NULL];
  CHECK([data writeToFile:path atomically:YES]);
  return path;
}

NSArray* command(NSString* name, id parameter0, id parameter1) {
  return [NSArray arrayWithObject:[NSArray arrayWithObjects:name, parameter0, parameter1, nil]];
}

void letTimePass(NSTimeInterval seconds) {
  NSDate* end = [NSDate dateWithTimeIntervalSinceNow:seconds];
  while ([end timeIntervalSinceNow] > 0) {
    NSAutoreleasePool* pool = [[NSAutoreleasePool alloc] init];
    [[NSRunLoop currentRunLoop] runMode:NSDefaultRunLoopMode beforeDate:end];
    [pool release];
  }
}

NSNumber* number(NSInteger value) { return [NSNumber numberWithInteger:value]; }
