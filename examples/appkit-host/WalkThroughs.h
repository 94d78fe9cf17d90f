// SPDX-License-Identifier: MIT
// The walk-throughs of the application: all that the application needs for them.
#import "OrderForm.h"
#import "QZ_Plist_State_Parser.h"

@interface WalkThroughs : NSObject <QZ_Plist_State_Parser_SheetDelegate> {
  OrderForm* form;
  NSWindow* tips;
  QZ_Plist_State_Parser* engine;  // of the current walk-through, or of the last one
}

- (id)initWithForm:(OrderForm*)aForm;
- (NSWindow*)tips;

/// Plays a walk-through over the form itself.
- (IBAction)showAround:(id)sender;
/// Plays one in a sheet over the form.
- (IBAction)showTips:(id)sender;
/// One walk-through at a time.
- (BOOL)validateMenuItem:(id)item;

@end
