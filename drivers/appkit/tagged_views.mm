// SPDX-License-Identifier: MIT
#import "drivers/appkit/tagged_views.hpp"

@implementation QZTaggedView

- (NSInteger)tag {
  return tag_;
}

- (void)setTag:(NSInteger)tag {
  tag_ = tag;
}

@end

@implementation QZTaggedBox

- (NSInteger)tag {
  return tag_;
}

- (void)setTag:(NSInteger)tag {
  tag_ = tag;
}

@end
