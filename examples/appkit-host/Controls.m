// SPDX-License-Identifier: MIT
#import "Controls.h"

NSTextField* addField(NSView* view, NSRect frame, NSInteger tag) {
  NSTextField* field = [[[NSTextField alloc] initWithFrame:frame] autorelease];
  [field setTag:tag];
  [view addSubview:field];
  return field;
}

NSTextField* addLabel(NSView* view, NSString* text, NSRect frame) {
  NSTextField* label = addField(view, frame, 0);
  [label setStringValue:text];
  [label setEditable:NO];
  [label setSelectable:NO];
  [label setBezeled:NO];
  [label setDrawsBackground:NO];
  return label;
}

NSButton* addButton(NSView* view, NSString* title, NSRect frame, NSInteger tag) {
  NSButton* button = [[[NSButton alloc] initWithFrame:frame] autorelease];
  [button setTitle:title];
  [button setBezelStyle:NSRoundedBezelStyle];
  [button setTag:tag];
  [view addSubview:button];
  return button;
}

NSButton* addSwitch(NSView* view, NSString* title, NSRect frame, NSInteger tag) {
  NSButton* button = addButton(view, title, frame, tag);
  [button setButtonType:NSSwitchButton];
  return button;
}

void connectButton(NSButton* button, id target, SEL action) {
  [button setTarget:target];
  [button setAction:action];
}
