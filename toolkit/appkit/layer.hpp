// SPDX-License-Identifier: MIT
// The layer of a view, which shows an image behind the subviews.
#pragma once

#import <AppKit/AppKit.h>

#include "qz/toolkit/image.hpp"

namespace qz::toolkit::appkit {

/// Gives the view a layer, or takes it away.
void setLayered(NSView* view, bool wants);
/// Fills the view's layer with the image; an absent image clears it.
void showLayerContents(NSView* view, const Ref<Image>& image);
/// Whether `view` is only the layer of its superview.
bool isLayer(NSView* view);

}  // namespace qz::toolkit::appkit
