// SPDX-License-Identifier: MIT
// Plays the walk-throughs of examples/appkit-host, as its user does. If PICTURES is set to a
// directory, a picture of every step is written there. (AppKit would open an argument as a
// document.)

#import "WalkThroughs.h"
#import "checks.h"

static NSString* pictures = nil;

static void show(NSWindow* window, NSString* step) {
  if (!pictures) return;
  letTimePass(0.2);
  [window display];
  NSView* content = [window contentView];
  [content lockFocus];
  NSBitmapImageRep* picture =
      [[[NSBitmapImageRep alloc] initWithFocusedViewRect:[content bounds]] autorelease];
  [content unlockFocus];
  NSString* file = [pictures stringByAppendingPathComponent:[step stringByAppendingString:@".png"]];
  NSData* png = [picture representationUsingType:NSPNGFileType
                                      properties:[NSDictionary dictionary]];
  CHECK([png writeToFile:file atomically:NO]);
}

static void press(NSWindow* window, NSInteger tag) { [controlIn(window, tag) performClick:nil]; }

static BOOL says(NSWindow* window, NSInteger tag, NSString* words) {
  return [[controlIn(window, tag) stringValue] rangeOfString:words].length > 0;
}

static void theTourLeadsOverTheForm(void) {
  OrderForm* form = [[OrderForm alloc] init];
  WalkThroughs* walkThroughs = [[WalkThroughs alloc] initWithForm:form];
  NSWindow* window = [form window];
  NSButton* order = controlIn(window, 8);
  NSButton* express = controlIn(window, 5);
  [window makeKeyAndOrderFront:nil];
  CHECK([controlIn(window, 10) isHidden] && [controlIn(window, 20) isHidden]);
  show(window, @"form");

  CHECK([walkThroughs validateMenuItem:nil]);
  [walkThroughs showAround:nil];
  CHECK(![walkThroughs validateMenuItem:nil]);
  CHECK(![controlIn(window, 10) isHidden] && says(window, 10, @"Welcome."));
  CHECK([controlIn(window, 11) image] != nil);
  CHECK(![order isEnabled]);
  show(window, @"tour-1");
  WAIT_UNTIL([[controlIn(window, 20) cell] isHighlighted]);
  CHECK([[controlIn(window, 20) cell] isHighlighted]);
  show(window, @"tour-1-flash");

  press(window, 20);
  CHECK(says(window, 10, @"Express and Insured cost a little more"));
  CHECK_EQUAL([express toolTip], @"Two days instead of five");
  press(window, 5);
  CHECK([express state] == NSOnState);
  show(window, @"tour-2");
  press(window, 21);
  CHECK([order isEnabled] && says(window, 10, @"That is all"));
  show(window, @"tour-3");
  press(window, 8);
  CHECK(says(window, 10, @"works again after the tour"));
  show(window, @"tour-3-order");
  press(window, 22);
  CHECK([controlIn(window, 10) isHidden] && [window isVisible]);
  CHECK([walkThroughs validateMenuItem:nil]);
  show(window, @"tour-end");

  CHECK([order target] == form);
  CHECK_EQUAL(NSStringFromSelector([order action]), @"placeOrder:");
  [order performClick:nil];
  CHECK([express target] == form && [window delegate] == form);
  show(window, @"form-ordered");
  [walkThroughs showAround:nil];  // again
  CHECK(says(window, 10, @"Welcome."));
  [walkThroughs release];
  CHECK([order target] == form && [window isVisible]);
  [window orderOut:nil];
  [form release];
}

static void theTipsAreInASheet(void) {
  OrderForm* form = [[OrderForm alloc] init];
  WalkThroughs* walkThroughs = [[WalkThroughs alloc] initWithForm:form];
  NSWindow* tips = [walkThroughs tips];
  [[form window] makeKeyAndOrderFront:nil];
  for (int i = 0; i < 2; ++i) {
    CHECK(![tips isVisible]);
    [walkThroughs showTips:nil];
    CHECK([tips isVisible] && says(tips, 1, @"Tip 1 of 3") &&
          says(tips, 2, @"Heavy things go below"));
    show(tips, @"tips-1");
    press(tips, 10);
    CHECK(says(tips, 1, @"Tip 2 of 3"));
    show(tips, @"tips-2");
    press(tips, 11);
    CHECK(says(tips, 1, @"Tip 3 of 3") && ![controlIn(tips, 12) isEnabled]);
    show(tips, @"tips-3");
    press(tips, 99);
    CHECK(![tips isVisible] && [[form window] isVisible]);
  }
  [walkThroughs release];
  [[form window] orderOut:nil];
  [form release];
}

int main(void) {
  NSAutoreleasePool* pool = [[NSAutoreleasePool alloc] init];
  [[NSApplication sharedApplication] finishLaunching];
  pictures = [[[NSProcessInfo processInfo] environment] objectForKey:@"PICTURES"];
  runTest("theTourLeadsOverTheForm", theTourLeadsOverTheForm);
  runTest("theTipsAreInASheet", theTipsAreInASheet);
  [pool release];
  return testResult();
}
