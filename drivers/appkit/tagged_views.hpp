// SPDX-License-Identifier: MIT
// Views without a role, with a tag: AppKit's own `NSView` and `NSBox` have a fixed one.
#pragma once

#import <AppKit/AppKit.h>

@interface QZTaggedView : NSView {
 @private
  NSInteger tag_;
}
- (void)setTag:(NSInteger)tag;
@end

@interface QZTaggedBox : NSBox {
 @private
  NSInteger tag_;
}
- (void)setTag:(NSInteger)tag;
@end
