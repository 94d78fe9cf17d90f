// SPDX-License-Identifier: MIT
// UTF-8: strict in files, generalised (surrogates encoded like any code point) in values.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

#include "text/words.hpp"

namespace qz::text {

/// U+FEFF in UTF-8, which at the start of a file shows that UTF-8 follows.
constexpr std::string_view byteOrderMark = "\xEF\xBB\xBF";

/// Returns the length of the character that starts at `at`, before the end of `text`; 0 if it is
/// not strictly valid UTF-8.
std::size_t utf8Length(std::string_view text, std::size_t at);

/// Returns the number of bytes at the start of `text` that are strictly valid UTF-8: no overlong
/// forms, no surrogates, nothing above U+10FFFF.
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

/// Appends a code point as one or two UTF-16 units.
void appendUtf16(std::u16string& text, char32_t codePoint);

/// Returns the code point at `position` in generalised UTF-8 and moves `position` past it.
char32_t nextCodePoint(std::string_view text, std::size_t& position);

inline bool isSurrogate(char32_t codePoint) { return codePoint >= 0xD800 && codePoint <= 0xDFFF; }
inline bool isHighSurrogate(char32_t unit) { return unit >= 0xD800 && unit <= 0xDBFF; }
inline bool isLowSurrogate(char32_t unit) { return unit >= 0xDC00 && unit <= 0xDFFF; }
inline char32_t combineSurrogates(char32_t high, char32_t low) {
  return 0x10000 + ((high - 0xD800) << 10) + (low - 0xDC00);
}

/// Builds text from single UTF-16 units. Two adjacent halves of a surrogate pair become one code
/// point; an unpaired half is kept.
class Utf16Appender {
 public:
  explicit Utf16Appender(std::string& text) : text_(text) {}
  void append(char16_t unit);
  /// Appends text of complete code points; a pending half stays unpaired.
  void append(std::string_view utf8) {
    if (utf8.empty()) return;
    waitingHigh_ = false;
    text_ += utf8;
  }

 private:
  std::string& text_;
  bool waitingHigh_ = false;  // the text ends with a half that can still be joined
};

}  // namespace qz::text
