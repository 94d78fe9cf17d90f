// SPDX-License-Identifier: MIT
// Converts between the interface's rectangles, with the origin at the lower left, and Qt's.
#pragma once

#include <QRect>

#include "qz/toolkit/geometry.hpp"

namespace qz::toolkit::qt {

/// Flips y for `rect` in an area of that height; works in both directions. The only place that
/// does.
Rect flipped(const Rect& rect, double areaHeight);

/// Returns the nearest rectangle of whole numbers that Qt accepts.
QRect rounded(const Rect& rect);
Rect exactly(const QRect& rect);

}  // namespace qz::toolkit::qt
