// SPDX-License-Identifier: MIT
#import "WalkThroughs.h"

#import "Controls.h"

/// Plays over a window that stays open, and whose buttons work again afterwards.
@interface FormEngine : QZ_Plist_State_Parser {
  OrderForm* form;
}
- (id)initWithForm:(OrderForm*)aForm;
@end

@implementation FormEngine

- (id)initWithForm:(OrderForm*)aForm {
  self = [super initWithWindow:nil];
  form = [aForm retain];
  [self getGuiAssetsFromWindow:[form window]];
  return self;
}

- (void)dealloc {
  [form release];
  [super dealloc];
}

- (void)buttonPushed:(id)sender {
  [super buttonPushed:sender];
  [form showPrice:sender];  // the check boxes are the form's own
}

- (void)terminateParser {
  [self setHasTerminated:YES];  // otherwise the end closes the window
  [super terminateParser];
  [form connectButtons];
}

@end

static NSWindow* tipsPanel(void) {
  NSWindow* panel = [[NSPanel alloc] initWithContentRect:NSMakeRect(0, 0, 360, 180)
                                               styleMask:NSTitledWindowMask
                                                 backing:NSBackingStoreBuffered
                                                   defer:NO];
  [panel setTitle:@"Tips"];
  [panel setReleasedWhenClosed:NO];
  NSView* content = [panel contentView];
  [addLabel(content, @"", NSMakeRect(10, 135, 340, 36)) setTag:1];
  [addLabel(content, @"", NSMakeRect(10, 50, 340, 80)) setTag:2];
  addButton(content, @"Next tip", NSMakeRect(120, 10, 110, 26), 10);
  addButton(content, @"Close", NSMakeRect(240, 10, 110, 26), 99);
  return panel;
}

@implementation WalkThroughs

- (id)initWithForm:(OrderForm*)aForm {
  self = [super init];
  form = [aForm retain];
  tips = tipsPanel();
  return self;
}

- (void)dealloc {
  [engine terminateParser];
  [engine release];
  [tips release];
  [form release];
  [super dealloc];
}

- (NSWindow*)tips {
  return tips;
}

- (void)play:(NSString*)script with:(QZ_Plist_State_Parser*)newEngine asSheet:(BOOL)asSheet {
  [engine autorelease];
  engine = [newEngine retain];
  [engine loadPlist:script runFromKey:@"0" withDelegate:self runAsSheet:asSheet];
}

- (IBAction)showAround:(id)sender {
  [self play:@"tour.plist" with:[[[FormEngine alloc] initWithForm:form] autorelease] asSheet:NO];
}

- (IBAction)showTips:(id)sender {
  QZ_Plist_State_Parser* inSheet =
      [[[QZ_Plist_State_Parser alloc] initWithWindow:[form window]] autorelease];
  [inSheet getGuiAssetsFromWindow:tips];
  [self play:@"tips.plist" with:inSheet asSheet:YES];
}

- (void)sheetDidEnd:(NSWindow*)sheet
         returnCode:(NSInteger)returnCode
        contextInfo:(void*)contextInfo {
  [sheet orderOut:nil];
}

- (BOOL)validateMenuItem:(id)item {
  return engine == nil || [engine terminating];
}

@end
