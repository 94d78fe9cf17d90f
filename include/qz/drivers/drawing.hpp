// SPDX-License-Identifier: MIT
// What drivers can do whose toolkit draws windows without a screen.
#pragma once

#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "qz/api.hpp"
#include "qz/toolkit/toolkit.hpp"

namespace qz::drivers {

/// A picture, row by row from the top.
struct QZ_API Pixels {
  int width = 0;                      ///< in pixels
  int height = 0;                     ///< in pixels
  std::vector<std::uint32_t> argb{};  ///< opacity, red, green and blue, a byte each

  friend bool operator==(const Pixels&, const Pixels&) = default;
};

/// A driver may be one of these too: `dynamic_cast` says so.
class QZ_API Drawing {
 public:
  virtual ~Drawing() = default;

  /// Makes all windows of this program look the same on every machine from now on: keeps them off
  /// the screen, and draws them in the toolkit's own style and colours. `fonts` are the bytes of
  /// font files; texts without a font of their own have that of the first. Without any they have
  /// the machine's.
  virtual void drawAlike(std::span<const std::string_view> fonts) = 0;
  /// Returns a picture of the window's content, with `density` pixels a point; empty if the window
  /// is not shown.
  virtual Pixels draw(const toolkit::Ref<toolkit::Window>& window, double density) = 0;
  /// Returns an opaque picture as a small PNG file: the same bytes for the same picture. A picture
  /// without colours has 16 shades of grey.
  virtual std::string pngOf(const Pixels& pixels) = 0;
};

}  // namespace qz::drivers
