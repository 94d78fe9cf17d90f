// SPDX-License-Identifier: MIT
// How readable colours are on each other, by WCAG 2.1.
#pragma once

#include <QColor>

namespace qz::toolkit::qt {

/// The contrast that WCAG level AA requires for normal text.
inline constexpr double readableContrast = 4.5;

/// Returns the contrast of two colours, from 1 (the same colour) to 21 (black and white). Ignores
/// opacity.
double contrast(const QColor& a, const QColor& b);

/// Returns `preferred` if it is readable on `ground`; otherwise white or black, one of which always
/// is.
QColor readableOn(const QColor& ground, const QColor& preferred);

/// Returns the colour halfway between two: disabled text becomes fainter but stays visible.
QColor halfway(const QColor& a, const QColor& b);

}  // namespace qz::toolkit::qt
