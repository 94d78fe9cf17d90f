// SPDX-License-Identifier: MIT
// ASCII digits and letters, independent of the locale.
#pragma once

namespace toolkit {

constexpr bool isDigit(char c) { return c >= '0' && c <= '9'; }

constexpr char lowered(char c) {
  return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

}  // namespace toolkit
