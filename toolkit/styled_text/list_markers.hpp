// SPDX-License-Identifier: MIT
// The markers of list items.
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace qz::toolkit::html {

enum class MarkerKind : std::uint8_t {
  disc,
  circle,
  square,
  decimal,
  lowerAlpha,
  upperAlpha,
  lowerRoman,
  upperRoman
};

/// Returns the marker kind of a `type` attribute: "disc", "circle", "square" in any case, "1", "a",
/// "A", "i" or "I"; absent for any other value.
std::optional<MarkerKind> markerKindNamed(std::string_view type);

/// Returns the bullet of an unordered list at `level`, which is 1 for the outermost list of either
/// kind: disc, circle, then always square.
MarkerKind bulletAtLevel(std::size_t level);

/// Returns the marker of item `number`, such as "•" or "4.". Numbers without a form in letters or
/// Roman numerals become decimal.
std::string marker(MarkerKind kind, std::int64_t number);

}  // namespace qz::toolkit::html
