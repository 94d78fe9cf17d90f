// SPDX-License-Identifier: MIT
// Lays out the form by hand, as a nib would.
#import "OrderForm.h"

#import "Controls.h"

@implementation OrderForm

// The controls that no script names. They are in a view of their own, where the engine leaves them
// alone.
- (NSView*)ownControls {
  NSView* own = [[[NSView alloc] initWithFrame:NSMakeRect(0, 170, 480, 190)] autorelease];
  addLabel(own, @"Country", NSMakeRect(10, 160, 85, 20));
  country = [[[NSPopUpButton alloc] initWithFrame:NSMakeRect(100, 160, 370, 25)
                                        pullsDown:NO] autorelease];
  [country addItemsWithTitles:[NSArray arrayWithObjects:@"Austria", @"Denmark", @"France",
                                                        @"Germany", @"Poland", nil]];
  [own addSubview:country];
  addLabel(own, @"Parcels", NSMakeRect(10, 127, 85, 20));
  parcels = addField(own, NSMakeRect(100, 125, 60, 24), 0);
  [parcels setEditable:NO];
  stepper = [[[NSStepper alloc] initWithFrame:NSMakeRect(165, 125, 20, 24)] autorelease];
  [stepper setMinValue:1];
  [stepper setMaxValue:20];
  [stepper setTarget:self];
  [stepper setAction:@selector(showPrice:)];
  [own addSubview:stepper];
  addLabel(own, @"Remarks", NSMakeRect(10, 95, 85, 20));
  NSScrollView* scroll =
      [[[NSScrollView alloc] initWithFrame:NSMakeRect(100, 5, 370, 110)] autorelease];
  [scroll setHasVerticalScroller:YES];
  [scroll setBorderType:NSBezelBorder];
  remarks = [[[NSTextView alloc] initWithFrame:NSMakeRect(0, 0, 345, 105)] autorelease];
  [scroll setDocumentView:remarks];
  [own addSubview:scroll];
  return own;
}

- (void)addAddress:(NSView*)content {
  addLabel(content, @"Name", NSMakeRect(10, 442, 85, 20));
  name = addField(content, NSMakeRect(100, 440, 370, 24), 1);
  addLabel(content, @"Street", NSMakeRect(10, 407, 85, 20));
  street = addField(content, NSMakeRect(100, 405, 370, 24), 0);
  addLabel(content, @"City", NSMakeRect(10, 372, 85, 20));
  city = addField(content, NSMakeRect(100, 370, 370, 24), 3);
}

- (void)addButtons:(NSView*)content {
  express = addSwitch(content, @"Express", NSMakeRect(100, 140, 120, 20), 5);
  insured = addSwitch(content, @"Insured", NSMakeRect(230, 140, 120, 20), 6);
  price = addLabel(content, @"", NSMakeRect(100, 102, 110, 20));
  clear = addButton(content, @"Clear", NSMakeRect(230, 100, 110, 26), 9);
  order = addButton(content, @"Order", NSMakeRect(360, 100, 110, 26), 8);
  message = addLabel(content, @"", NSMakeRect(10, 2, 460, 18));
}

// Hidden unless a walk-through shows them.
- (void)addGuide:(NSView*)content {
  NSImageView* picture =
      [[[NSImageView alloc] initWithFrame:NSMakeRect(10, 24, 64, 64)] autorelease];
  [picture setTag:11];
  [picture setHidden:YES];
  [content addSubview:picture];
  NSTextField* guide = addLabel(content, @"", NSMakeRect(100, 22, 250, 68));
  [guide setTag:10];
  [guide setHidden:YES];
  [addButton(content, @"Next", NSMakeRect(360, 24, 110, 26), 20) setHidden:YES];
}

- (id)init {
  self = [super init];
  window = [[NSWindow alloc]
      initWithContentRect:NSMakeRect(300, 200, 480, 480)
                styleMask:NSTitledWindowMask | NSClosableWindowMask | NSMiniaturizableWindowMask
                  backing:NSBackingStoreBuffered
                    defer:NO];
  [window setTitle:@"Parcels"];
  [window setReleasedWhenClosed:NO];
  [window setDelegate:self];
  NSView* content = [window contentView];
  [self addAddress:content];
  [content addSubview:[self ownControls]];
  [self addButtons:content];
  [self addGuide:content];
  [self connectButtons];
  [self clearAll:nil];
  return self;
}

- (void)dealloc {
  [window setDelegate:nil];
  [window release];
  [super dealloc];
}

- (NSWindow*)window {
  return window;
}

- (void)connectButtons {
  connectButton(express, self, @selector(showPrice:));
  connectButton(insured, self, @selector(showPrice:));
  connectButton(order, self, @selector(placeOrder:));
  connectButton(clear, self, @selector(clearAll:));
}

- (IBAction)showPrice:(id)sender {
  int each = 6 + ([express state] == NSOnState ? 5 : 0) + ([insured state] == NSOnState ? 2 : 0);
  [parcels setIntValue:[stepper intValue]];
  [price setStringValue:[NSString stringWithFormat:@"%d EUR", each * [stepper intValue]]];
}

- (IBAction)placeOrder:(id)sender {
  [message setStringValue:[NSString stringWithFormat:@"Ordered for %@: %@", [name stringValue],
                                                     [price stringValue]]];
}

- (IBAction)clearAll:(id)sender {
  [name setStringValue:@""];
  [street setStringValue:@""];
  [city setStringValue:@""];
  [remarks setString:@""];
  [stepper setIntValue:1];
  [express setState:NSOffState];
  [insured setState:NSOffState];
  [self showPrice:nil];
}

- (void)windowWillClose:(NSNotification*)notification {
  [NSApp terminate:nil];
}

@end
