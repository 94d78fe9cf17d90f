// SPDX-License-Identifier: MIT
// Images in labels, and behind the subviews of a view.
#pragma once

#include "toolkit/image.hpp"

class QLabel;
class QWidget;

namespace toolkit::qt {

/// Shows `image` in the middle of the label, shrunk with its proportions where it does not fit,
/// never enlarged; absent shows nothing.
void showImage(QLabel& label, const Ref<Image>& image);
/// The very image that was shown last; absent where there is none, or the host has set another
/// pixmap since.
Ref<Image> shownImage(const QLabel& label);

/// Whether the widget has a layer, which alone has contents. Without it the contents go.
void setLayered(QWidget& widget, bool layered);
bool isLayered(const QWidget& widget);
/// Shows `image` scaled to the whole of the widget, behind its subviews; absent clears it. Without
/// a layer nothing happens.
void showLayerContents(QWidget& widget, const Ref<Image>& image);
Ref<Image> layerContents(const QWidget& widget);

}  // namespace toolkit::qt
