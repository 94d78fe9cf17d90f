// SPDX-License-Identifier: MIT
// Converts rectangles of doubles and of whole numbers.

#include "toolkit/qt/coordinates.hpp"

#include <algorithm>
#include <cmath>

namespace qz::toolkit::qt {

namespace {

// The limit of Qt's own geometry (`QWIDGETSIZE_MAX`).
constexpr double farthest = (1 << 24) - 1;

int whole(double length) {
  if (std::isnan(length)) return 0;
  return static_cast<int>(std::lround(std::clamp(length, -farthest, farthest)));
}

}  // namespace

Rect flipped(const Rect& rect, double areaHeight) {
  return {rect.x, areaHeight - rect.y - rect.height, rect.width, rect.height};
}

QRect rounded(const Rect& rect) {
  return {whole(rect.x), whole(rect.y), std::max(0, whole(rect.width)),
          std::max(0, whole(rect.height))};
}

Rect exactly(const QRect& rect) {
  return {static_cast<double>(rect.x()), static_cast<double>(rect.y()),
          static_cast<double>(rect.width()), static_cast<double>(rect.height())};
}

}  // namespace qz::toolkit::qt
