// SPDX-License-Identifier: MIT
// Rectangles. Lengths are points; the origin is at the lower left, y grows upwards.
#pragma once

#include "qz/api.hpp"

namespace qz::toolkit {

/// A rectangle. The origin is at the lower left.
struct QZ_API Rect {
  double x = 0;       ///< of the left edge, in points
  double y = 0;       ///< of the lower edge, in points
  double width = 0;   ///< in points
  double height = 0;  ///< in points

  friend bool operator==(const Rect&, const Rect&) = default;
};

}  // namespace qz::toolkit
