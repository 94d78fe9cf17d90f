// SPDX-License-Identifier: MIT
#include "tools/storyboard/picture_store.hpp"

#include <functional>
#include <string_view>

namespace qz::tools::storyboard {
namespace {

constexpr double density = 2;  // pixels a point

}  // namespace

std::vector<std::size_t> PictureStore::add(const toolkit::Ref<toolkit::Window>& window,
                                           const walkthrough::StepPicture& picture) {
  const drivers::Pixels pixels = artist_.draw(window, density);
  if (pixels.argb.empty()) return {};
  if (page_.ground.empty()) {
    ground_ = pixels;
    page_.ground = artist_.pngOf(pixels);
  }
  std::vector<drawing::Area> areas;
  for (const auto& control : picture.controls) {
    areas.push_back(
        drawing::areaOf(control.view.frame, picture.window->content.height, density, pixels));
  }
  std::vector<std::size_t> numbers;
  for (const auto& patch : drawing::patches(ground_, pixels, areas)) {
    numbers.push_back(numberOf(patch));
  }
  return numbers;
}

std::size_t PictureStore::numberOf(const drawing::Patch& patch) {
  const auto& argb = patch.pixels.argb;
  const std::string_view bytes(reinterpret_cast<const char*>(argb.data()),
                               argb.size() * sizeof(argb.front()));
  // Keeping all pixels would take hundreds of megabytes; that two patches of one area have the same
  // hash by chance is less likely than a fault of the machine.
  const auto [known, isNew] = numbers_.try_emplace(
      {patch.area, std::hash<std::string_view>()(bytes)}, page_.patches.size());
  if (!isNew) return known->second;
  const auto& [x, y, width, height] = patch.area;
  page_.patches.push_back(
      {.area = {static_cast<double>(x) / ground_.width, static_cast<double>(y) / ground_.height,
                static_cast<double>(width) / ground_.width,
                static_cast<double>(height) / ground_.height},
       .png = artist_.pngOf(patch.pixels)});
  return known->second;
}

}  // namespace qz::tools::storyboard
