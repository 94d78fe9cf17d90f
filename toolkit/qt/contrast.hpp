// SPDX-License-Identifier: MIT
// How well colours read on each other, after WCAG 2.1.
#pragma once

#include <QColor>

namespace toolkit::qt {

/// What WCAG's level AA asks of common text.
inline constexpr double readableContrast = 4.5;

/// From 1 (the same colour) to 21 (black and white). Opacity does not count.
double contrast(const QColor& a, const QColor& b);

/// `preferred` where it reads on `ground`; else white or black, one of which always does.
QColor readableOn(const QColor& ground, const QColor& preferred);

/// The colour between two: what is disabled stands back without being gone.
QColor halfway(const QColor& a, const QColor& b);

}  // namespace toolkit::qt
