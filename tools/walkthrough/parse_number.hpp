// SPDX-License-Identifier: MIT
// Reads a text as one number.
#pragma once

#include <charconv>
#include <optional>
#include <string_view>
#include <system_error>

namespace qz::tools::walkthrough {

/// Returns the number that `text` spells from its first character to its last; absent otherwise.
template <class T>
std::optional<T> parseNumber(std::string_view text) {
  T number{};
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
  const bool whole = error == std::errc{} && end == text.data() + text.size();
  return whole ? std::optional(number) : std::nullopt;
}

}  // namespace qz::tools::walkthrough
