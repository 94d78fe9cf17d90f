// SPDX-License-Identifier: MIT
// Compares a place at each side of the target.

#include "hosts/qt/guide_placement.hpp"

#include <algorithm>
#include <array>
#include <tuple>

namespace qz::hosts::qt {

namespace {

constexpr int distance = 8;  // between the target and the panel, in points

enum class Side : std::uint8_t { right, below, left, above };

// A rectangle that is too large begins where the area begins.
QRect movedInto(const QRect& area, QRect rect) {
  rect.moveRight(std::min(rect.right(), area.right()));
  rect.moveBottom(std::min(rect.bottom(), area.bottom()));
  rect.moveLeft(std::max(rect.left(), area.left()));
  rect.moveTop(std::max(rect.top(), area.top()));
  return rect;
}

// The panel begins where the target begins, in the direction of reading and from above.
QRect placeAt(Side side, const Surroundings& around, const QSize& size) {
  const QRect& target = around.target;
  QRect place(target.topLeft(), size);
  if (around.direction == Qt::RightToLeft) place.moveRight(target.right());
  if (side == Side::right) place.moveLeft(target.right() + 1 + distance);
  if (side == Side::below) place.moveTop(target.bottom() + 1 + distance);
  if (side == Side::left) place.moveRight(target.left() - 1 - distance);
  if (side == Side::above) place.moveBottom(target.top() - 1 - distance);
  return movedInto(around.area, place);
}

int commonArea(const QRect& a, const QRect& b) {
  const QRect common = a & b;
  return common.isEmpty() ? 0 : common.width() * common.height();
}

QRect middleOf(const Surroundings& around, const QSize& size) {
  QRect place({}, size);
  place.moveCenter(around.window.center());
  return movedInto(around.area, place);
}

}  // namespace

QRect placeBeside(const Surroundings& around, const QSize& size) {
  if (around.target.isEmpty()) return middleOf(around, size);
  std::array sides{Side::right, Side::below, Side::left, Side::above};
  if (around.direction == Qt::RightToLeft) std::swap(sides[0], sides[2]);
  std::array<QRect, 4> places;
  std::transform(sides.begin(), sides.end(), places.begin(),
                 [&](Side side) { return placeAt(side, around, size); });
  const auto cost = [&](const QRect& place) {
    return std::tuple(commonArea(place, around.target), commonArea(place, around.window));
  };
  return *std::min_element(places.begin(), places.end(),
                           [&](const QRect& a, const QRect& b) { return cost(a) < cost(b); });
}

}  // namespace qz::hosts::qt
