// SPDX-License-Identifier: MIT
// Where a panel goes.
#pragma once

#include <QRect>

namespace qz::hosts::qt {

/// What decides where a panel goes. All rectangles have the same coordinates.
struct Surroundings {
  QRect area;    ///< in which the panel must stay, such as a screen
  QRect window;  ///< that the panel should cover as little as possible
  QRect target;  ///< that the panel points at; empty if it points at nothing
  Qt::LayoutDirection direction = Qt::LeftToRight;
};

/// Returns the place of a panel of the size: inside the area, and beside the target without
/// covering it. Of several such places it is the one that covers least of the window, and of those
/// the first of: after the target in the direction of reading, below, before, above. If the target
/// leaves no room, the place that covers least of it. Without a target, in the middle of the
/// window.
QRect placeBeside(const Surroundings& around, const QSize& size);

}  // namespace qz::hosts::qt
