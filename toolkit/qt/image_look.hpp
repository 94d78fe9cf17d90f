// SPDX-License-Identifier: MIT
// Images in labels, and behind the subviews of a view.
#pragma once

#include "qz/toolkit/image.hpp"

class QLabel;
class QWidget;

namespace qz::toolkit::qt {

/// Shows `image` in the middle of the label, shrunk in proportion if it does not fit, never
/// enlarged. An absent image shows nothing.
void showImage(QLabel& label, const Ref<Image>& image);
/// Returns the image that was shown last; absent if there is none or the host has set another
/// pixmap since.
Ref<Image> shownImage(const QLabel& label);

/// Forgets the image that was shown last. The label keeps its pixmap.
void dropImage(QLabel& label);

/// Gives the widget a layer or removes the layer with its contents. Only a layer has contents.
void setLayered(QWidget& widget, bool layered);
bool isLayered(const QWidget& widget);
/// Shows `image` scaled to the whole widget, behind its subviews. An absent image clears the layer.
/// Does nothing without a layer.
void showLayerContents(QWidget& widget, const Ref<Image>& image);
Ref<Image> layerContents(const QWidget& widget);

}  // namespace qz::toolkit::qt
