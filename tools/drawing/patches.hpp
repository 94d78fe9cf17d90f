// SPDX-License-Identifier: MIT
// What is different between two pictures of a window, in rectangles.
#pragma once

#include <span>
#include <vector>

#include "qz/drivers/drawing.hpp"

namespace qz::tools::drawing {

/// A rectangle of a picture, in pixels from the top left.
struct Area {
  int x = 0;
  int y = 0;
  int width = 0;
  int height = 0;

  friend auto operator<=>(const Area&, const Area&) = default;
};

/// A part of a picture.
struct Patch {
  Area area{};
  drivers::Pixels pixels{};
};

/// Returns the rectangle of a control in a picture of its window, as far as it is in there.
/// `height` is that of the window in points, `density` the picture's pixels a point.
Area areaOf(const toolkit::Rect& frame, double height, double density,
            const drivers::Pixels& picture);

/// Returns patches that make `picture` of `ground`: one for what is different in each of the areas,
/// and one for what else is. Both pictures must have the same size.
std::vector<Patch> patches(const drivers::Pixels& ground, const drivers::Pixels& picture,
                           std::span<const Area> areas);

}  // namespace qz::tools::drawing
