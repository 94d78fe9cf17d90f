// SPDX-License-Identifier: MIT
// Colours, and the standard ones by name.
#pragma once

#include "qz/api.hpp"

namespace qz::toolkit {

/// Red, green, blue and alpha, each from 0 to 1, in sRGB.
struct QZ_API Color {
  double red = 0;    ///< from 0 to 1
  double green = 0;  ///< from 0 to 1
  double blue = 0;   ///< from 0 to 1
  double alpha = 1;  ///< from 0, transparent, to 1

  friend bool operator==(const Color&, const Color&) = default;
};

/// The standard colours (`NSColor`'s class operations of these names).
namespace colors {
inline constexpr Color black{0, 0, 0};       ///< 0, 0, 0
inline constexpr Color blue{0, 0, 1};        ///< 0, 0, 1
inline constexpr Color gray{0.5, 0.5, 0.5};  ///< 0.5, 0.5, 0.5
inline constexpr Color green{0, 1, 0};       ///< 0, 1, 0
inline constexpr Color orange{1, 0.5, 0};    ///< 1, 0.5, 0
inline constexpr Color red{1, 0, 0};         ///< 1, 0, 0
inline constexpr Color white{1, 1, 1};       ///< 1, 1, 1
}  // namespace colors

}  // namespace qz::toolkit
