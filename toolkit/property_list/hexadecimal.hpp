// SPDX-License-Identifier: MIT
// Hexadecimal digits, as numbers and data are written with.
#pragma once

namespace toolkit {

/// What an ASCII character counts as a hexadecimal digit, or -1.
constexpr int hexadecimalDigit(char c) {
  if (c >= '0' && c <= '9') return c - '0';
  if (c >= 'a' && c <= 'f') return c - 'a' + 10;
  if (c >= 'A' && c <= 'F') return c - 'A' + 10;
  return -1;
}

}  // namespace toolkit
