// SPDX-License-Identifier: MIT
// From the interface's rectangles, with the origin at the lower left, to Qt's and back.
#pragma once

#include <QRect>

#include "toolkit/geometry.hpp"

namespace toolkit::qt {

/// The one place where y is turned over: `rect` in an area of that height, to and fro.
Rect flipped(const Rect& rect, double areaHeight);

/// The nearest whole rectangle that Qt takes.
QRect rounded(const Rect& rect);
Rect exactly(const QRect& rect);

}  // namespace toolkit::qt
