// SPDX-License-Identifier: MIT
// Hexadecimal digits of numbers and data.
#pragma once

#include <string>
#include <string_view>

namespace qz::text {

/// Returns the value of a hexadecimal digit; -1 for any other character.
constexpr int hexadecimalDigit(char c) {
  if (c >= '0' && c <= '9') return c - '0';
  if (c >= 'a' && c <= 'f') return c - 'a' + 10;
  if (c >= 'A' && c <= 'F') return c - 'A' + 10;
  return -1;
}

constexpr bool isHexadecimalDigit(char c) { return hexadecimalDigit(c) >= 0; }

/// Returns the digit for a number below 16, in lower case.
constexpr char hexadecimalCharacter(unsigned number) { return "0123456789abcdef"[number]; }

/// Returns two digits for a byte, in lower case.
inline std::string hexadecimal(unsigned char byte) {
  return {hexadecimalCharacter(byte >> 4U), hexadecimalCharacter(byte & 15U)};
}

/// Returns two digits for each byte, in lower case.
inline std::string hexadecimal(std::string_view bytes) {
  std::string digits;
  digits.reserve(2 * bytes.size());
  for (const char c : bytes) digits += hexadecimal(static_cast<unsigned char>(c));
  return digits;
}

}  // namespace qz::text
