// SPDX-License-Identifier: MIT
// Compares whole rows of areas, which is fast even where single pixels are not.
#include "tools/drawing/patches.hpp"

#include <algorithm>
#include <cmath>

namespace qz::tools::drawing {
namespace {

using drivers::Pixels;

/// Returns where a row of an area begins among the pixels.
std::size_t rowStart(const Pixels& pixels, const Area& area, int row) {
  return static_cast<std::size_t>(area.y + row) * static_cast<std::size_t>(pixels.width) +
         static_cast<std::size_t>(area.x);
}

/// Calls `see` with the beginnings of the rows of an area.
template <class See>
void eachRow(const Pixels& pixels, const Area& area, See see) {
  for (int row = 0; row < area.height; ++row) see(rowStart(pixels, area, row));
}

/// Returns the area with a margin, and with edges between the same pixels of both pictures even
/// where they are shown smaller: else rests of what is below would be seen there.
Area withMargin(const Area& area, const Pixels& picture) {
  constexpr int margin = 4;
  const auto before = [](int edge) { return std::max(edge - margin, 0) / margin * margin; };
  const auto behind = [](int edge, int most) {
    return std::min((edge + 2 * margin - 1) / margin * margin, most);
  };
  const int x = before(area.x);
  const int y = before(area.y);
  return {x, y, behind(area.x + area.width, picture.width) - x,
          behind(area.y + area.height, picture.height) - y};
}

Patch cut(const Pixels& picture, const Area& area) {
  Patch patch{.area = area, .pixels = {.width = area.width, .height = area.height}};
  eachRow(picture, area, [&](std::size_t start) {
    const auto* const from = picture.argb.data() + start;
    patch.pixels.argb.insert(patch.pixels.argb.end(), from, from + area.width);
  });
  return patch;
}

void paste(const Pixels& picture, const Area& area, Pixels& canvas) {
  eachRow(picture, area, [&](std::size_t start) {
    std::copy_n(picture.argb.data() + start, area.width, canvas.argb.data() + start);
  });
}

/// Returns the smallest area with everything that is different in an area; without height if
/// nothing is.
Area differenceIn(const Area& area, const Pixels& a, const Pixels& b) {
  int left = area.width;
  int right = 0;
  int top = area.height;
  int bottom = 0;
  for (int y = 0; y < area.height; ++y) {
    const auto* const row = a.argb.data() + rowStart(a, area, y);
    const auto* const other = b.argb.data() + rowStart(b, area, y);
    if (std::equal(row, row + area.width, other)) continue;
    int first = 0;
    while (row[first] == other[first]) ++first;
    int last = area.width - 1;
    while (row[last] == other[last]) --last;
    left = std::min(left, first);
    right = std::max(right, last + 1);
    top = std::min(top, y);
    bottom = y + 1;
  }
  if (bottom == 0) return {};
  return {area.x + left, area.y + top, right - left, bottom - top};
}

}  // namespace

Area areaOf(const toolkit::Rect& frame, double height, double density,
            const drivers::Pixels& picture) {
  const auto pixel = [&](double points, int most) {
    return static_cast<int>(
        std::clamp(std::floor(points * density), 0.0, static_cast<double>(most)));
  };
  const double top = height - frame.y - frame.height;
  const int x = pixel(frame.x, picture.width);
  const int y = pixel(top, picture.height);
  return {x, y, pixel(frame.x + frame.width, picture.width) - x,
          pixel(top + frame.height, picture.height) - y};
}

std::vector<Patch> patches(const Pixels& ground, const Pixels& picture,
                           std::span<const Area> areas) {
  std::vector<Patch> found;
  Pixels canvas = ground;
  const auto patch = [&](const Area& area) {
    const Area different = differenceIn(area, canvas, picture);
    if (different.height == 0) return;
    const Area whole = withMargin(different, picture);
    found.push_back(cut(picture, whole));
    paste(picture, whole, canvas);
  };
  for (const Area& area : areas) patch(area);
  patch({0, 0, picture.width, picture.height});
  return found;
}

}  // namespace qz::tools::drawing
