// SPDX-License-Identifier: MIT
// Numbers as decimal text.
#pragma once

#include <array>
#include <charconv>
#include <string>

namespace qz::text {

/// Returns the shortest decimal text that reads back as the same number.
template <class Numeric>
std::string decimal(Numeric number) {
  std::array<char, 32> buffer;
  const auto [end, error] = std::to_chars(buffer.data(), buffer.data() + buffer.size(), number);
  return {buffer.data(), end};
}

}  // namespace qz::text
