// SPDX-License-Identifier: MIT
// GNUstep's views have no layers. There a view behind the others shows the image.

#import "toolkit/appkit/layer.hpp"

#import "toolkit/appkit/images.hpp"

#ifdef GNUSTEP

@interface QZLayerView : NSImageView
@end

@implementation QZLayerView

// Lets every click through to what lies behind.
- (NSView*)hitTest:(NSPoint)point {
  (void)point;
  return nil;
}

@end

namespace qz::toolkit::appkit {

namespace {

QZLayerView* layerOf(NSView* view) {
  NSArray* const views = [view subviews];
  NSView* const rearmost = [views count] > 0 ? [views objectAtIndex:0] : nil;
  return isLayer(rearmost) ? static_cast<QZLayerView*>(rearmost) : nil;
}

void addLayer(NSView* view) {
  QZLayerView* const layer = [[QZLayerView alloc] initWithFrame:[view bounds]];
  [layer setImageScaling:NSImageScaleAxesIndependently];
  [layer setImageFrameStyle:NSImageFrameNone];
  [layer setAutoresizingMask:NSViewWidthSizable | NSViewHeightSizable];
  [view addSubview:layer positioned:NSWindowBelow relativeTo:nil];
  [layer release];
}

}  // namespace

bool isLayer(NSView* view) { return [view isKindOfClass:[QZLayerView class]]; }

void setLayered(NSView* view, bool wants) {
  if (wants && !layerOf(view)) addLayer(view);
  if (!wants) [layerOf(view) removeFromSuperview];
}

void showLayerContents(NSView* view, const Ref<Image>& image) {
  [layerOf(view) setImage:AppKitImage::objectOf(image)];
}

}  // namespace qz::toolkit::appkit

#else

#import <QuartzCore/QuartzCore.h>

namespace qz::toolkit::appkit {

bool isLayer(NSView*) { return false; }

void setLayered(NSView* view, bool wants) { [view setWantsLayer:wants]; }

void showLayerContents(NSView* view, const Ref<Image>& image) {
  [[view layer] setContents:AppKitImage::objectOf(image)];
}

}  // namespace qz::toolkit::appkit

#endif
