// SPDX-License-Identifier: MIT
// The markers of list items.
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace toolkit::html {

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

/// What the `type` attribute of a list or item says: "disc", "circle", "square" in any case, "1",
/// "a", "A", "i" or "I"; absent where it says nothing.
std::optional<MarkerKind> markerKindNamed(std::string_view type);

/// The bullets of an unordered list at `level`, which counts from 1 at the outermost list of either
/// kind: disc, circle, and squares from there on.
MarkerKind bulletAtLevel(std::size_t level);

/// The marker of item `number`, such as "•" or "4.". Numbers that letters or Roman numerals cannot
/// express are decimal.
std::string marker(MarkerKind kind, std::int64_t number);

}  // namespace toolkit::html
