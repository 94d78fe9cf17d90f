// SPDX-License-Identifier: MIT
#import "toolkit/foundation/strings.hpp"

#include "text/utf8.hpp"

namespace qz::toolkit::foundation {

namespace {

NSString* fromUnits(const std::u16string& units) {
  return [NSString stringWithCharacters:reinterpret_cast<const unichar*>(units.data())
                                 length:units.size()];
}

// Of code points one by one: halves of a pair that belong together are one code point.
std::u16string unitsOf(std::string_view text, bool keepsUnpairedSurrogates) {
  constexpr char32_t replacement = 0xFFFD;
  std::u16string units;
  for (std::size_t position = 0; position < text.size();) {
    const char32_t codePoint = text::nextCodePoint(text, position);
    const bool isKept = keepsUnpairedSurrogates || !text::isSurrogate(codePoint);
    text::appendUtf16(units, isKept ? codePoint : replacement);
  }
  return units;
}

}  // namespace

NSString* nsString(std::string_view text) {
  if (text::isAscii(text)) {
    return [[[NSString alloc] initWithBytes:text.data()
                                     length:text.size()
                                   encoding:NSASCIIStringEncoding] autorelease];
  }
  NSString* const exact = fromUnits(unitsOf(text, true));
  return exact ? exact : fromUnits(unitsOf(text, false));  // GNUstep refuses unpaired surrogates
}

std::string utf8(NSString* string) {
  std::u16string units([string length], u'\0');
  [string getCharacters:reinterpret_cast<unichar*>(units.data())
                  range:NSMakeRange(0, units.size())];
  std::string text;
  text::Utf16Appender appender(text);
  for (const char16_t unit : units) appender.append(unit);
  return text;
}

}  // namespace qz::toolkit::foundation
