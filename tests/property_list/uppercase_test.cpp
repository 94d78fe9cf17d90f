// SPDX-License-Identifier: MIT
// Upper case by the rules of Unicode: every class of letter, and everything that is not a letter.

#include "text/uppercase.hpp"

#include <gtest/gtest.h>

#include <string>
#include <string_view>

namespace qz {

namespace {

using text::uppercased;

struct UppercaseCase {
  const char* name;
  std::string_view text;
  std::string_view upper;
};

void check(const UppercaseCase& wanted) {
  EXPECT_EQ(text::uppercased(wanted.text), wanted.upper) << wanted.name;
}

TEST(Uppercase, SingleLetters) {
  constexpr UppercaseCase cases[] = {
      {"ASCII", "abcxyz", "ABCXYZ"},
      {"ASCII around the letters", "@[`{/:09AZ_", "@[`{/:09AZ_"},
      {"Latin-1", "àöøþ", "ÀÖØÞ"},
      {"no letter between Latin-1's", "÷×", "÷×"},
      {"out of Latin-1", "ÿ", "Ÿ"},
      {"the micro sign", "µ", "Μ"},
      {"pairs side by side", "āăĳžǆ", "ĀĂĲŽǄ"},
      {"the title-case digraphs", "ǅǈǋǲ", "ǄǇǊǱ"},
      {"the dotless i", "ı", "I"},
      {"the long s", "ſ", "S"},
      {"letters whose capitals lie apart", "ɐɽɫʞ", "ⱯⱤⱢꞰ"},
      {"Greek", "αβγώϊ", "ΑΒΓΏΪ"},
      {"the final sigma", "ςσ", "ΣΣ"},
      {"Greek symbols", "ϐϑϕϖϰϱϵ", "ΒΘΦΠΚΡΕ"},
      {"Cyrillic", "абвяёџ", "АБВЯЁЏ"},
      {"Armenian", "աֆ", "ԱՖ"},
      {"Georgian", "აჰ", "ᲐᲰ"},
      {"Cherokee", "ꭰꮿᏸ", "ᎠᏯᏰ"},
      {"Glagolitic and Coptic", "ⰰⲁ", "ⰀⲀ"},
      {"Roman numerals", "ⅰⅿ", "ⅠⅯ"},
      {"letters in circles", "ⓐⓩ", "ⒶⓏ"},
      {"full-width letters", "ａｚ", "ＡＺ"},
      {"letters beyond 16 bits", "𐐨𞤢", "𐐀𞤀"},
      {"the combining iota", "\u0345", "Ι"},
  };
  for (const UppercaseCase& wanted : cases) check(wanted);
}

TEST(Uppercase, LettersThatBecomeSeveral) {
  constexpr UppercaseCase cases[] = {
      {"the sharp s", "straße", "STRASSE"},
      {"Latin ligatures", "ﬀﬁﬂﬃﬄﬅﬆ", "FFFIFLFFIFFLSTST"},
      {"Armenian ligatures", "ևﬓ", "ԵՒՄՆ"},
      {"letters with marks that have no capital", "ŉǰẖẗẘẙẚ", "ʼNJ̌H̱T̈W̊Y̊Aʾ"},
      {"Greek with two marks", "ΐΰ", "\u0399\u0308\u0301\u03A5\u0308\u0301"},
      {"Greek with an iota below", "ᾳῃῳᾀ", "ΑΙΗΙΩΙἈΙ"},
      {"Greek with an iota beside", "ᾼῌῼᾈ", "ΑΙΗΙΩΙἈΙ"},
  };
  for (const UppercaseCase& wanted : cases) check(wanted);
}

TEST(Uppercase, WhatHasNoUpperCaseStays) {
  using namespace std::string_view_literals;
  const UppercaseCase cases[] = {
      {"nothing", "", ""},
      {"capitals", "ABCÄÖΩЖİ", "ABCÄÖΩЖİ"},
      {"signs that look like letters", "K Å ℵ", "K Å ℵ"},
      {"letters without case", "漢字 あア 가 א ا ª º", "漢字 あア 가 א ا ª º"},
      {"digits and signs", "12 ٣ ½ €", "12 ٣ ½ €"},
      {"a zero byte", "a\0b"sv, "A\0B"sv},
      {"pictures", "🙂é", "🙂É"},
  };
  for (const UppercaseCase& wanted : cases) check(wanted);
}

// A name that is not valid text matches no command. Its bytes must stay, and nothing is read past
// them.
TEST(Uppercase, BytesThatAreNoTextStay) {
  constexpr UppercaseCase cases[] = {
      {"a lone continuation", "a\x80z", "A\x80Z"},
      {"a lead without continuation", "\xC3z", "\xC3Z"},
      {"a lead at the end", "z\xC3", "Z\xC3"},
      {"three bytes cut short", "z\xE2\x93", "Z\xE2\x93"},
      {"four bytes cut short", "\xF0\x90\x90z", "\xF0\x90\x90Z"},
      {"bytes that never occur", "a\xFE\xFF\xC0\xC1z", "A\xFE\xFF\xC0\xC1Z"},
      {"a surrogate", "a\xED\xA0\x80z", "A\xED\xA0\x80Z"},
  };
  for (const UppercaseCase& wanted : cases) check(wanted);
}

std::string encoded(char32_t c) {
  const auto byte = [](char32_t bits) { return static_cast<char>(bits); };
  if (c < 0x80) return {byte(c)};
  if (c < 0x800) return {byte(0xC0 | c >> 6), byte(0x80 | (c & 0x3F))};
  if (c < 0x10000) {
    return {byte(0xE0 | c >> 12), byte(0x80 | (c >> 6 & 0x3F)), byte(0x80 | (c & 0x3F))};
  }
  return {byte(0xF0 | c >> 18), byte(0x80 | (c >> 12 & 0x3F)), byte(0x80 | (c >> 6 & 0x3F)),
          byte(0x80 | (c & 0x3F))};
}

constexpr char32_t beyondAllCase = 0x20000;  // scripts from here on have no case

TEST(Uppercase, UpperCaseIsUpperCaseAlready) {
  int changed = 0;
  for (char32_t c = 0; c < beyondAllCase; ++c) {
    const std::string text = encoded(c);
    const std::string upper = text::uppercased(text);
    ASSERT_EQ(text::uppercased(upper), upper) << std::hex << static_cast<unsigned>(c);
    if (upper != text) ++changed;
  }
  EXPECT_GT(changed, 1400);  // each new version of Unicode may add letters with an upper case
}

TEST(Uppercase, WhatIsInUpperCaseIsNotCopied) {
  // Longer than two words of eight bytes, which are examined a word at a time.
  for (std::size_t at = 0; at < 19; ++at) {
    for (int c = 0; c < 0x100; ++c) {
      std::string text(19, '_');
      text[at] = static_cast<char>(c);
      const bool isLeft = c < 0x60;  // neither a small letter nor a sign next to them
      std::string storage;
      const std::string_view upper = text::uppercased(text, storage);
      ASSERT_EQ(upper, text::uppercased(text)) << c << " at " << at;
      ASSERT_EQ(upper.data() == text.data(), isLeft) << c << " at " << at;
    }
  }
}

TEST(Uppercase, ShortTextIsRaisedWithStorageToo) {
  std::string storage;
  EXPECT_EQ(text::uppercased("", storage), "");
  EXPECT_EQ(text::uppercased("setTag", storage), "SETTAG");
}

TEST(Uppercase, EveryCharacterIsOnItsOwn) {
  for (char32_t c = 0x80; c < beyondAllCase; ++c) {
    const std::string text = encoded(c);
    ASSERT_EQ(text::uppercased("a" + text + "z"), "A" + text::uppercased(text) + "Z")
        << std::hex << static_cast<unsigned>(c);
  }
}

}  // namespace

}  // namespace qz
