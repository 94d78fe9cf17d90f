// SPDX-License-Identifier: MIT
// An application with its own windows, and walk-throughs in its Help menu.
#import "WalkThroughs.h"

static NSMenu* addMenu(NSMenu* bar, NSString* title) {
  NSMenu* menu = [[[NSMenu alloc] initWithTitle:title] autorelease];
  [bar setSubmenu:menu forItem:[bar addItemWithTitle:title action:NULL keyEquivalent:@""]];
  return menu;
}

static void addItem(NSMenu* menu, NSString* title, SEL action, NSString* key, id target) {
  [[menu addItemWithTitle:title action:action keyEquivalent:key] setTarget:target];
}

static NSMenu* mainMenu(WalkThroughs* walkThroughs) {
  NSMenu* bar = [[[NSMenu alloc] initWithTitle:@"Parcels"] autorelease];
  NSMenu* application = addMenu(bar, @"Parcels");
  addItem(application, @"Quit", @selector(terminate:), @"q", NSApp);
  NSMenu* help = addMenu(bar, @"Help");
  addItem(help, @"Show me around", @selector(showAround:), @"1", walkThroughs);
  addItem(help, @"Tips", @selector(showTips:), @"2", walkThroughs);
  return bar;
}

int main(void) {
  NSAutoreleasePool* pool = [[NSAutoreleasePool alloc] init];
  [NSApplication sharedApplication];
  OrderForm* form = [[OrderForm alloc] init];
  WalkThroughs* walkThroughs = [[WalkThroughs alloc] initWithForm:form];
  [NSApp setMainMenu:mainMenu(walkThroughs)];
  [[form window] makeKeyAndOrderFront:nil];
  [NSApp run];
  [walkThroughs release];
  [form release];
  [pool release];
  return 0;
}
