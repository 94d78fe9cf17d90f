// SPDX-License-Identifier: MIT
// Rectangles. Lengths are points; the origin is at the lower left, y grows upwards.
#pragma once

namespace qz::toolkit {

struct Rect {
  double x = 0;
  double y = 0;
  double width = 0;
  double height = 0;

  friend bool operator==(const Rect&, const Rect&) = default;
};

}  // namespace qz::toolkit
