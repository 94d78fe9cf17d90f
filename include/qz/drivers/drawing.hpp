// SPDX-License-Identifier: MIT
// What drivers can do whose toolkit draws windows without a screen.
#pragma once

#include <span>
#include <string>
#include <string_view>

#include "qz/api.hpp"
#include "qz/toolkit/toolkit.hpp"

namespace qz::drivers {

/// A driver may be one of these too: `dynamic_cast` says so.
class QZ_API Drawing {
 public:
  virtual ~Drawing() = default;

  /// Makes all windows of this program look the same on every machine from now on: keeps them off
  /// the screen, and draws them in the toolkit's own style and colours. `fonts` are the bytes of
  /// font files; texts without a font of their own have that of the first. Without any they have
  /// the machine's.
  virtual void drawAlike(std::span<const std::string_view> fonts) = 0;
  /// Returns a picture of the window's content as a PNG file, with `density` pixels a point; empty
  /// if the window is not shown.
  virtual std::string drawPicture(const toolkit::Ref<toolkit::Window>& window, double density) = 0;
};

}  // namespace qz::drivers
