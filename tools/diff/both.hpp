// SPDX-License-Identifier: MIT
// Pairs of the same thing, of the old walk-through and of the new one.
#pragma once

#include <compare>
#include <cstdint>

namespace qz::tools::diff {

enum class Side : std::uint8_t { before, after };

inline constexpr Side bothSides[] = {Side::before, Side::after};

constexpr Side otherThan(Side side) { return side == Side::before ? Side::after : Side::before; }

template <class Value>
struct Both {
  Value before{};
  Value after{};

  Value& operator[](Side side) { return side == Side::before ? before : after; }
  const Value& operator[](Side side) const { return side == Side::before ? before : after; }
  friend auto operator<=>(const Both&, const Both&) = default;
};

}  // namespace qz::tools::diff
