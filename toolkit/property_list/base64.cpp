// SPDX-License-Identifier: MIT
#include "toolkit/property_list/base64.hpp"

#include <algorithm>
#include <array>
#include <cstdint>

namespace qz::toolkit {
namespace {

constexpr std::string_view base64Digits =
    "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
constexpr std::size_t bytesPerLine = 51;  // 68 digits

constexpr std::array<std::int8_t, 128> makeValues() {
  std::array<std::int8_t, 128> values{};
  values.fill(-1);
  for (std::size_t i = 0; i < base64Digits.size(); ++i) {
    values[static_cast<unsigned char>(base64Digits[i])] = static_cast<std::int8_t>(i);
  }
  values['='] = 0;
  return values;
}

bool isSpace(char c) { return c == ' ' || (c >= '\t' && c <= '\r'); }

}  // namespace

std::size_t decodeBase64(std::string_view text, std::string& bytes) {
  static constexpr std::array<std::int8_t, 128> values = makeValues();
  std::uint32_t group = 0;
  std::size_t count = 0;
  std::size_t padding = 0;  // number of `=` at the end, ignoring spaces
  for (std::size_t at = 0; at < text.size(); ++at) {
    const char c = text[at];
    const auto byte = static_cast<unsigned char>(c);
    if (byte >= values.size()) return at;
    if (c == '=') {
      ++padding;
    } else if (!isSpace(c)) {
      padding = 0;
    }
    if (values[byte] < 0) continue;
    group = (group << 6) | static_cast<std::uint32_t>(values[byte]);
    if (++count % 4 != 0) continue;
    bytes += static_cast<char>(group >> 16);
    if (padding < 2) bytes += static_cast<char>(group >> 8);
    if (padding < 1) bytes += static_cast<char>(group);
  }
  return text.size();
}

void encodeBase64(std::string_view bytes, std::string_view lineStart, std::string& text) {
  for (std::size_t at = 0; at < bytes.size(); at += 3) {
    if (at % bytesPerLine == 0) text.append(at == 0 ? "" : "\n").append(lineStart);
    const std::string_view group = bytes.substr(at, 3);
    std::uint32_t bits = 0;
    for (std::size_t i = 0; i < 3; ++i) {
      bits = (bits << 8) | (i < group.size() ? static_cast<unsigned char>(group[i]) : 0U);
    }
    for (std::size_t i = 0; i < 4; ++i) {
      text += i <= group.size() ? base64Digits[(bits >> (18 - 6 * i)) & 63] : '=';
    }
  }
}

}  // namespace qz::toolkit
