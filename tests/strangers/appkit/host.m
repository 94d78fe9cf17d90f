// SPDX-License-Identifier: MIT
// A host in Objective-C: a window with a button and a text field, and a script that drives them.
// Plays script.plist in the directory in which it runs.
#include <stdio.h>

#import "QZ_Plist_State_Parser.h"

static NSWindow* windowWith(NSButton* button, NSTextField* text) {
  NSWindow* window = [[[NSWindow alloc] initWithContentRect:NSMakeRect(100, 100, 400, 160)
                                                  styleMask:NSTitledWindowMask
                                                    backing:NSBackingStoreBuffered
                                                      defer:NO] autorelease];
  [window setReleasedWhenClosed:NO];
  [button setTag:2];
  [[window contentView] addSubview:button];
  [text setTag:5];
  [[window contentView] addSubview:text];
  return window;
}

static int play(void) {
  NSButton* button = [[[NSButton alloc] initWithFrame:NSMakeRect(300, 20, 80, 30)] autorelease];
  NSTextField* text = [[[NSTextField alloc] initWithFrame:NSMakeRect(20, 80, 360, 40)] autorelease];
  NSString* directory = [[NSFileManager defaultManager] currentDirectoryPath];
  QZ_Plist_State_Parser* engine = [[[QZ_Plist_State_Parser alloc] initWithWindow:nil] autorelease];
  [engine getGuiAssetsFromWindow:windowWith(button, text)];
  if (![engine loadPlist:[directory stringByAppendingPathComponent:@"script.plist"]
              runFromKey:@""
            withDelegate:nil
              runAsSheet:NO]) {
    return 1;
  }
  printf("text: %s\n", [[text stringValue] UTF8String]);
  [button performClick:nil];  // runs the list 2, which gives the button the tag 3
  printf("text: %s\n", [[text stringValue] UTF8String]);
  [button performClick:nil];  // runs the list 3, which ends the walk-through
  printf("last list: %s\n", [[engine currentCommandState] UTF8String]);
  return [engine terminating] ? 0 : 1;
}

int main(void) {
  NSAutoreleasePool* pool = [[NSAutoreleasePool alloc] init];
  [NSApplication sharedApplication];
  int status = play();
  [pool release];
  return status;
}
