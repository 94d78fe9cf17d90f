// SPDX-License-Identifier: MIT
#include "toolkit/property_list/old_style_tokens.hpp"

#include <algorithm>
#include <array>

#include "text/hexadecimal.hpp"
#include "text/utf8.hpp"

namespace qz::toolkit {
namespace {

// The upper half of the NeXTSTEP character set, which octal escapes use. Its last two places are
// undefined; the platform reads them as U+0000.
constexpr std::array<char16_t, 128> nextStep = {
    0x00A0, 0x00C0, 0x00C1, 0x00C2, 0x00C3, 0x00C4, 0x00C5, 0x00C7, 0x00C8, 0x00C9, 0x00CA, 0x00CB,
    0x00CC, 0x00CD, 0x00CE, 0x00CF, 0x00D0, 0x00D1, 0x00D2, 0x00D3, 0x00D4, 0x00D5, 0x00D6, 0x00D9,
    0x00DA, 0x00DB, 0x00DC, 0x00DD, 0x00DE, 0x00B5, 0x00D7, 0x00F7, 0x00A9, 0x00A1, 0x00A2, 0x00A3,
    0x2044, 0x00A5, 0x0192, 0x00A7, 0x00A4, 0x2019, 0x201C, 0x00AB, 0x2039, 0x203A, 0xFB01, 0xFB02,
    0x00AE, 0x2013, 0x2020, 0x2021, 0x00B7, 0x00A6, 0x00B6, 0x2022, 0x201A, 0x201E, 0x201D, 0x00BB,
    0x2026, 0x2030, 0x00AC, 0x00BF, 0x00B9, 0x02CB, 0x00B4, 0x02C6, 0x02DC, 0x00AF, 0x02D8, 0x02D9,
    0x00A8, 0x00B2, 0x02DA, 0x00B8, 0x00B3, 0x02DD, 0x02DB, 0x02C7, 0x2014, 0x00B1, 0x00BC, 0x00BD,
    0x00BE, 0x00E0, 0x00E1, 0x00E2, 0x00E3, 0x00E4, 0x00E5, 0x00E7, 0x00E8, 0x00E9, 0x00EA, 0x00EB,
    0x00EC, 0x00C6, 0x00ED, 0x00AA, 0x00EE, 0x00EF, 0x00F0, 0x00F1, 0x0141, 0x00D8, 0x0152, 0x00BA,
    0x00F2, 0x00F3, 0x00F4, 0x00F5, 0x00F6, 0x00E6, 0x00F9, 0x00FA, 0x00FB, 0x0131, 0x00FC, 0x00FD,
    0x0142, 0x00F8, 0x0153, 0x00DF, 0x00FE, 0x00FF, 0x0000, 0x0000};

constexpr std::string_view lineSeparator = "\u2028";
constexpr std::string_view paragraphSeparator = "\u2029";
static_assert(lineSeparator.size() == paragraphSeparator.size());

bool startsWithSeparator(std::string_view text) {
  return text.starts_with(lineSeparator) || text.starts_with(paragraphSeparator);
}

}  // namespace

bool isBareCharacter(char c) {
  const char lower = static_cast<char>(c | 0x20);
  return (lower >= 'a' && lower <= 'z') || (c >= '0' && c <= '9') ||
         std::string_view("_$/:.-").find(c) != std::string_view::npos;
}

std::size_t OldStyleTokens::spaceLength() const {
  const char c = peek();
  if (c == ' ' || (c >= '\t' && c <= '\r')) return 1;
  return startsWithSeparator(text_.substr(at_)) ? lineSeparator.size() : 0;
}

void OldStyleTokens::skipLineComment() {
  while (at_ < text_.size() && text_[at_] != '\n' && text_[at_] != '\r' &&
         !startsWithSeparator(text_.substr(at_))) {
    ++at_;
  }
}

/// An unclosed comment extends to the end.
void OldStyleTokens::skipBlockComment() {
  const std::size_t end = text_.find("*/", at_ + 2);
  at_ = end == std::string_view::npos ? text_.size() : end + 2;
}

bool OldStyleTokens::skipToToken() {
  while (at_ < text_.size()) {
    const std::string_view rest = text_.substr(at_);
    if (const std::size_t length = spaceLength()) {
      at_ += length;
    } else if (rest.starts_with("//")) {
      skipLineComment();
    } else if (rest.starts_with("/*")) {
      skipBlockComment();
    } else {
      return true;
    }
  }
  return false;
}

bool OldStyleTokens::take(char c) {
  if (!skipToToken() || peek() != c) return false;
  ++at_;
  return true;
}

void OldStyleTokens::refuseUnexpected(std::string_view expected) const {
  std::string found = "the end of the file";
  if (at_ < text_.size()) {
    std::size_t end = at_;
    text::nextCodePoint(text_, end);
    found = "'" + std::string(text_.substr(at_, end - at_)) + "'";
  }
  refuse("expected " + std::string(expected) + ", found " + found);
}

bool OldStyleTokens::isAtString() const {
  return at_ < text_.size() && (peek() == '"' || peek() == '\'' || isBareCharacter(peek()));
}

std::string_view OldStyleTokens::string() {
  return isBareCharacter(peek()) ? bareString() : quotedString();
}

std::string_view OldStyleTokens::bareString() {
  const std::size_t start = at_;
  while (at_ < text_.size() && isBareCharacter(text_[at_])) ++at_;
  return text_.substr(start, at_ - start);
}

std::string_view OldStyleTokens::quotedString() {
  const std::size_t opening = at_;
  const std::array<char, 2> stops = {text_[at_++], '\\'};
  buffer_.clear();
  text::Utf16Appender appender(buffer_);
  while (true) {
    const std::size_t stop = text_.find_first_of({stops.data(), stops.size()}, at_);
    if (stop == std::string_view::npos) {
      at_ = opening;
      refuse("the string is not closed");
    }
    appender.append(text_.substr(at_, stop - at_));
    at_ = stop + 1;
    if (text_[stop] != '\\') return buffer_;
    if (at_ == text_.size()) continue;  // the next search refuses: the string is not closed
    if (static_cast<unsigned char>(peek()) < 0x80) {
      appender.append(escapedUnit());
    }
  }
}

/// Reads a number of at most `most` digits.
unsigned OldStyleTokens::digits(unsigned base, std::size_t most) {
  unsigned number = 0;
  for (std::size_t count = 0; count < most && at_ < text_.size(); ++count, ++at_) {
    const int digit = text::hexadecimalDigit(text_[at_]);
    if (digit < 0 || static_cast<unsigned>(digit) >= base) break;
    number = number * base + static_cast<unsigned>(digit);
  }
  return number;
}

char16_t OldStyleTokens::escapedUnit() {
  const char c = text_[at_];
  if (c >= '0' && c <= '7') {
    const unsigned byte = digits(8, 3) % 256;
    return byte < 0x80 ? static_cast<char16_t>(byte) : nextStep[byte - 0x80];
  }
  ++at_;
  switch (c) {
    case 'U':
      return static_cast<char16_t>(digits(16, 4));
    case 'a':
      return '\a';
    case 'b':
      return '\b';
    case 'f':
      return '\f';
    case 'n':
      return '\n';
    case 'r':
      return '\r';
    case 't':
      return '\t';
    case 'v':
      return '\v';
    default:
      return static_cast<char16_t>(c);
  }
}

std::string_view OldStyleTokens::data() {
  buffer_.clear();
  constexpr std::string_view spaces = " \t\r\n";
  while (true) {
    while (at_ < text_.size() && spaces.find(text_[at_]) != std::string_view::npos) ++at_;
    if (peek() == '>') break;
    const int high = text::hexadecimalDigit(peek());
    if (high < 0) refuseUnexpected("two hexadecimal digits or '>'");
    ++at_;
    const int low = text::hexadecimalDigit(peek());
    if (low < 0) refuseUnexpected("the second hexadecimal digit of a byte");
    ++at_;
    buffer_ += static_cast<char>(high * 16 + low);
  }
  ++at_;
  return buffer_;
}

}  // namespace qz::toolkit
