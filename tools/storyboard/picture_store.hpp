// SPDX-License-Identifier: MIT
// The pictures of a page, taken apart so that what they have in common is there once.
#pragma once

#include <map>
#include <utility>
#include <vector>

#include "tools/drawing/patches.hpp"
#include "tools/storyboard/page.hpp"

namespace qz::tools::storyboard {

class PictureStore {
 public:
  /// Puts the pictures into the page: the first as its ground. The arguments must outlive it.
  PictureStore(drivers::Drawing& artist, Page& page) : artist_(artist), page_(page) {}

  /// Draws the window, and returns the patches that make its picture of the page's ground.
  std::vector<std::size_t> add(const toolkit::Ref<toolkit::Window>& window,
                               const walkthrough::StepPicture& picture);

 private:
  std::size_t numberOf(const drawing::Patch& patch);

  drivers::Drawing& artist_;
  Page& page_;
  drivers::Pixels ground_;
  std::map<std::pair<drawing::Area, std::size_t>, std::size_t> numbers_;  // by area and hash
};

}  // namespace qz::tools::storyboard
