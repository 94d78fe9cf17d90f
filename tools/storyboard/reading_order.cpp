// SPDX-License-Identifier: MIT
#include "tools/storyboard/reading_order.hpp"

#include <algorithm>

namespace qz::tools::storyboard {
namespace {

using toolkit::Rect;

double topOf(const Rect& frame) { return frame.y + frame.height; }

/// Whether most of the lower control is beside the row's first. The origin is at the bottom.
bool isInRow(const Rect& first, const Rect& frame) {
  const double overlap = topOf(frame) - std::max(first.y, frame.y);
  return overlap > std::min(first.height, frame.height) / 2;
}

}  // namespace

std::vector<std::size_t> readingOrder(const walkthrough::StepPicture& picture) {
  const auto frameOf = [&](std::size_t control) -> const Rect& {
    return picture.controls[control].view.frame;
  };
  std::vector<std::size_t> order;
  for (std::size_t i = 0; i < picture.controls.size(); ++i) {
    if (!picture.controls[i].view.hidden) order.push_back(i);
  }
  std::stable_sort(order.begin(), order.end(), [&](std::size_t a, std::size_t b) {
    return topOf(frameOf(a)) > topOf(frameOf(b));
  });
  for (auto begin = order.begin(); begin != order.end();) {
    const auto end = std::find_if_not(begin, order.end(), [&](std::size_t control) {
      return isInRow(frameOf(*begin), frameOf(control));
    });
    const auto next = end == begin ? begin + 1 : end;  // a control without height
    std::stable_sort(begin, next,
                     [&](std::size_t a, std::size_t b) { return frameOf(a).x < frameOf(b).x; });
    begin = next;
  }
  return order;
}

}  // namespace qz::tools::storyboard
