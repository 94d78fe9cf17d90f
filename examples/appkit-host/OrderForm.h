// SPDX-License-Identifier: MIT
// The host's own window: an order form for parcels. It knows nothing of walk-throughs except the
// tags by which scripts name its controls.
#import <AppKit/AppKit.h>

@interface OrderForm : NSObject <NSWindowDelegate> {
  NSWindow* window;
  NSTextField* name;
  NSTextField* street;
  NSTextField* city;
  NSPopUpButton* country;
  NSTextField* parcels;
  NSStepper* stepper;
  NSTextView* remarks;
  NSButton* express;
  NSButton* insured;
  NSTextField* price;
  NSTextField* message;
  NSButton* order;
  NSButton* clear;
}

- (NSWindow*)window;

/// Makes the form the target of its buttons, as it is without a walk-through.
- (void)connectButtons;

/// Calculates the price from the controls.
- (IBAction)showPrice:(id)sender;
/// Empties the form.
- (IBAction)clearAll:(id)sender;

@end
