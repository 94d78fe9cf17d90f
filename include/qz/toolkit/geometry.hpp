// SPDX-License-Identifier: MIT
// Rectangles. Lengths are points; the origin is at the lower left, y grows upwards.
#pragma once

#include "qz/api.hpp"

namespace qz::toolkit {

struct QZ_API Rect {
  double x = 0;
  double y = 0;
  double width = 0;
  double height = 0;

  friend bool operator==(const Rect&, const Rect&) = default;
};

}  // namespace qz::toolkit
