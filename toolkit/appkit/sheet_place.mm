// SPDX-License-Identifier: MIT
// A transparent view covers the parent's content and swallows the user's input. It lies beside the
// content view, so that it is not one of the window's controls.

#import "toolkit/appkit/sheet_place.hpp"

@interface QZSheetCover : NSView
@end

@implementation QZSheetCover

- (BOOL)acceptsFirstResponder {
  return YES;
}

- (BOOL)performKeyEquivalent:(NSEvent*)event {
  (void)event;
  return YES;
}

- (void)mouseDown:(NSEvent*)event {
  (void)event;
}

- (void)keyDown:(NSEvent*)event {
  (void)event;
}

@end

namespace qz::toolkit::appkit {

namespace {

NSView* coveredContent(NSWindow* window) {
  NSView* const content = [window contentView];
  QZSheetCover* const cover = [[[QZSheetCover alloc] initWithFrame:[content frame]] autorelease];
  [cover setAutoresizingMask:[content autoresizingMask]];
  [[content superview] addSubview:cover positioned:NSWindowAbove relativeTo:content];
  return cover;
}

// At the top edge of the parent's content, in its middle.
NSPoint placeOver(NSWindow* parent, NSWindow* sheet) {
  const NSRect content = [parent contentRectForFrameRect:[parent frame]];
  const NSRect own = [sheet frame];
  return NSMakePoint(NSMidX(content) - own.size.width / 2, NSMaxY(content) - own.size.height);
}

}  // namespace

SheetPlace::SheetPlace(NSWindow* sheet, NSWindow* parent) : cover_(coveredContent(parent)) {
  [sheet setFrameOrigin:placeOver(parent, sheet)];
}

SheetPlace::~SheetPlace() { [cover_.get() removeFromSuperview]; }

bool SheetPlace::covers(NSWindow* window) {
  NSView* const frontmost = [[[[window contentView] superview] subviews] lastObject];
  return [frontmost isKindOfClass:[QZSheetCover class]];
}

}  // namespace qz::toolkit::appkit
