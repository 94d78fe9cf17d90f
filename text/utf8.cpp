// SPDX-License-Identifier: MIT
#include "text/utf8.hpp"

#include <cstdint>
#include <cstring>

namespace qz::text {
namespace {

constexpr std::size_t surrogateLength = 3;

unsigned byteAt(std::string_view text, std::size_t position) {
  return static_cast<unsigned char>(text[position]);
}

}  // namespace

std::size_t utf8Length(std::string_view text, std::size_t at) {
  const unsigned lead = byteAt(text, at);
  if (lead < 0x80) return 1;
  // The range of the second byte excludes overlong forms, surrogates and code points above
  // U+10FFFF.
  unsigned lowest = 0x80;
  unsigned highest = 0xBF;
  std::size_t length = 0;
  if (lead >= 0xC2 && lead <= 0xDF) {
    length = 2;
  } else if (lead >= 0xE0 && lead <= 0xEF) {
    length = 3;
    if (lead == 0xE0) lowest = 0xA0;
    if (lead == 0xED) highest = 0x9F;
  } else if (lead >= 0xF0 && lead <= 0xF4) {
    length = 4;
    if (lead == 0xF0) lowest = 0x90;
    if (lead == 0xF4) highest = 0x8F;
  }
  if (length == 0 || text.size() - at < length) return 0;
  if (byteAt(text, at + 1) < lowest || byteAt(text, at + 1) > highest) return 0;
  for (std::size_t i = 2; i < length; ++i) {
    if ((byteAt(text, at + i) & 0xC0) != 0x80) return 0;
  }
  return length;
}

std::size_t validUtf8Length(std::string_view text) {
  constexpr std::uint64_t highBits = 0x8080808080808080;
  std::size_t at = 0;
  while (at < text.size()) {
    std::uint64_t word = 0;
    if (text.size() - at >= sizeof word) {
      std::memcpy(&word, text.data() + at, sizeof word);
      if ((word & highBits) == 0) {
        at += sizeof word;
        continue;
      }
    }
    const std::size_t length = utf8Length(text, at);
    if (length == 0) break;
    at += length;
  }
  return at;
}

void appendUtf8(std::string& text, char32_t codePoint) {
  const auto byte = [&](char32_t bits) { text += static_cast<char>(bits); };
  if (codePoint < 0x80) return byte(codePoint);
  if (codePoint < 0x800) {
    byte(0xC0 | (codePoint >> 6));
  } else {
    if (codePoint < 0x10000) {
      byte(0xE0 | (codePoint >> 12));
    } else {
      byte(0xF0 | (codePoint >> 18));
      byte(0x80 | ((codePoint >> 12) & 0x3F));
    }
    byte(0x80 | ((codePoint >> 6) & 0x3F));
  }
  byte(0x80 | (codePoint & 0x3F));
}

void appendUtf16(std::u16string& text, char32_t codePoint) {
  if (codePoint < 0x10000) {
    text += static_cast<char16_t>(codePoint);
    return;
  }
  const char32_t offset = codePoint - 0x10000;
  text += static_cast<char16_t>(0xD800 + (offset >> 10));
  text += static_cast<char16_t>(0xDC00 + (offset & 0x3FF));
}

char32_t nextCodePoint(std::string_view text, std::size_t& position) {
  const unsigned lead = byteAt(text, position++);
  if (lead < 0xC0) return lead;
  const int more = lead < 0xE0 ? 1 : lead < 0xF0 ? 2 : 3;
  char32_t codePoint = lead & (0x3FU >> more);
  for (int i = 0; i < more && position < text.size(); ++i) {
    codePoint = (codePoint << 6) | (byteAt(text, position++) & 0x3F);
  }
  return codePoint;
}

void Utf16Appender::append(char16_t unit) {
  if (waitingHigh_ && isLowSurrogate(unit)) {
    std::size_t at = text_.size() - surrogateLength;
    const char32_t high = nextCodePoint(text_, at);
    text_.resize(text_.size() - surrogateLength);
    appendUtf8(text_, combineSurrogates(high, unit));
    waitingHigh_ = false;
    return;
  }
  appendUtf8(text_, unit);
  waitingHigh_ = isHighSurrogate(unit);
}

}  // namespace qz::text
