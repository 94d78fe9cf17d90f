// SPDX-License-Identifier: MIT
// Text as ASCII bytes.
#pragma once

#include <algorithm>
#include <optional>
#include <string>
#include <string_view>

namespace toolkit {

/// Returns `utf8` as ASCII bytes; absent if it has a character that ASCII lacks.
inline std::optional<std::string> asciiBytes(std::string_view utf8) {
  const bool ascii = std::all_of(utf8.begin(), utf8.end(),
                                 [](char c) { return static_cast<unsigned char>(c) < 0x80; });
  return ascii ? std::optional<std::string>(utf8) : std::nullopt;
}

}  // namespace toolkit
