// SPDX-License-Identifier: MIT
// UTF-8, strict where files are read, and generalized (surrogates like any code point) in values.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

#include "toolkit/property_list/words.hpp"

namespace toolkit {

/// U+FEFF, which at the start of a file says that UTF-8 follows.
constexpr std::string_view byteOrderMark = "\xEF\xBB\xBF";

/// How many bytes at the start of `text` are valid UTF-8 as Unicode defines it: no overlong forms,
/// no surrogates, nothing above U+10FFFF. All of `text` when that is its size.
std::size_t validUtf8Length(std::string_view text);

/// Whether all of `text` is ASCII.
inline bool isAscii(std::string_view text) {
  std::uint64_t seen = 0;
  for (; text.size() >= words::size; text.remove_prefix(words::size)) {
    seen |= words::load(text.data());
  }
  for (const char c : text) seen |= static_cast<unsigned char>(c);
  return (seen & words::highBits) == 0;
}

/// Appends a code point up to U+10FFFF, surrogates included.
void appendUtf8(std::string& text, char32_t codePoint);

/// Appends a code point as one UTF-16 unit or two.
void appendUtf16(std::u16string& text, char32_t codePoint);

/// The code point that starts at `position` in generalized UTF-8; moves `position` behind it.
char32_t nextCodePoint(std::string_view text, std::size_t& position);

inline bool isSurrogate(char32_t codePoint) { return codePoint >= 0xD800 && codePoint <= 0xDFFF; }
inline bool isHighSurrogate(char32_t unit) { return unit >= 0xD800 && unit <= 0xDBFF; }
inline bool isLowSurrogate(char32_t unit) { return unit >= 0xDC00 && unit <= 0xDFFF; }
inline char32_t combineSurrogates(char32_t high, char32_t low) {
  return 0x10000 + ((high - 0xD800) << 10) + (low - 0xDC00);
}

/// Builds text from UTF-16 units that come one by one; halves of a pair that meet become one code
/// point, a half that stays alone is kept as it is.
class Utf16Appender {
 public:
  explicit Utf16Appender(std::string& text) : text_(text) {}
  void append(char16_t unit);
  /// Text that is whole code points already: a half that waits stays alone.
  void append(std::string_view utf8) {
    if (utf8.empty()) return;
    waitingHigh_ = false;
    text_ += utf8;
  }

 private:
  std::string& text_;
  bool waitingHigh_ = false;  // whether the text ends with a half that can still be joined
};

}  // namespace toolkit
