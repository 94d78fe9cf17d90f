// SPDX-License-Identifier: MIT
// Computes WCAG's relative luminance and contrast.

#include "toolkit/qt/contrast.hpp"

#include <algorithm>
#include <cmath>

namespace qz::toolkit::qt {

namespace {

double linear(double channel) {
  return channel <= 0.04045 ? channel / 12.92 : std::pow((channel + 0.055) / 1.055, 2.4);
}

double luminance(const QColor& color) {
  const QColor rgb = color.toRgb();
  return 0.2126 * linear(static_cast<double>(rgb.redF())) +
         0.7152 * linear(static_cast<double>(rgb.greenF())) +
         0.0722 * linear(static_cast<double>(rgb.blueF()));
}

}  // namespace

double contrast(const QColor& a, const QColor& b) {
  const auto [darker, lighter] = std::minmax({luminance(a), luminance(b)});
  return (lighter + 0.05) / (darker + 0.05);
}

QColor readableOn(const QColor& ground, const QColor& preferred) {
  if (contrast(ground, preferred) >= readableContrast) return preferred;
  const QColor black(Qt::black);
  const QColor white(Qt::white);
  return contrast(ground, black) >= contrast(ground, white) ? black : white;
}

QColor halfway(const QColor& a, const QColor& b) {
  return QColor::fromRgbF((a.redF() + b.redF()) / 2, (a.greenF() + b.greenF()) / 2,
                          (a.blueF() + b.blueF()) / 2, a.alphaF());
}

}  // namespace qz::toolkit::qt
