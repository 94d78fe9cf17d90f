// SPDX-License-Identifier: MIT
// Make the controls of both windows.
#import <AppKit/AppKit.h>

NSTextField* addLabel(NSView* view, NSString* text, NSRect frame);
NSTextField* addField(NSView* view, NSRect frame, NSInteger tag);
NSButton* addButton(NSView* view, NSString* title, NSRect frame, NSInteger tag);
/// A button that is on or off.
NSButton* addSwitch(NSView* view, NSString* title, NSRect frame, NSInteger tag);
void connectButton(NSButton* button, id target, SEL action);
