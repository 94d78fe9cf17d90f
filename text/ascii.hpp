// SPDX-License-Identifier: MIT
// ASCII digits and letters, independent of the locale.
#pragma once

#include <algorithm>
#include <optional>
#include <string>
#include <string_view>

namespace qz::text {

constexpr bool isDigit(char c) { return c >= '0' && c <= '9'; }

constexpr char lowered(char c) {
  return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

constexpr bool isLetter(char c) { return lowered(c) >= 'a' && lowered(c) <= 'z'; }

/// Returns `text` with its ASCII letters in lower case.
inline std::string lowered(std::string_view text) {
  std::string result(text);
  for (char& c : result) c = lowered(c);
  return result;
}

/// Returns `utf8` as ASCII bytes; absent if it has a character that ASCII lacks.
inline std::optional<std::string> asciiBytes(std::string_view utf8) {
  const bool ascii = std::all_of(utf8.begin(), utf8.end(),
                                 [](char c) { return static_cast<unsigned char>(c) < 0x80; });
  return ascii ? std::optional<std::string>(utf8) : std::nullopt;
}

}  // namespace qz::text
