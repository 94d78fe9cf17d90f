// SPDX-License-Identifier: MIT
// Digits and letters of ASCII: of all bytes, exactly these.
#include "text/ascii.hpp"

#include <gtest/gtest.h>

#include <string>
#include <string_view>

#include "text/hexadecimal.hpp"

namespace qz::text {
namespace {

/// Returns every byte for which `holds` is true, in the order of their numbers.
template <class Predicate>
std::string bytesFor(Predicate holds) {
  std::string bytes;
  for (int byte = 0; byte < 0x100; ++byte) {
    if (holds(static_cast<char>(byte))) bytes += static_cast<char>(byte);
  }
  return bytes;
}

constexpr std::string_view digits = "0123456789";
constexpr std::string_view capitals = "ABCDEFGHIJKLMNOPQRSTUVWXYZ";
constexpr std::string_view smallLetters = "abcdefghijklmnopqrstuvwxyz";

TEST(Ascii, DigitsAndLettersAreNothingElse) {
  EXPECT_EQ(bytesFor([](char c) { return isDigit(c); }), digits);
  EXPECT_EQ(bytesFor([](char c) { return isLetter(c); }),
            std::string(capitals) + std::string(smallLetters));
  EXPECT_EQ(bytesFor([](char c) { return isHexadecimalDigit(c); }), "0123456789ABCDEFabcdef");
}

TEST(Ascii, OnlyCapitalsChangeInLowerCase) {
  EXPECT_EQ(bytesFor([](char c) { return lowered(c) != c; }), capitals);
  EXPECT_EQ(lowered(capitals), smallLetters);
  const std::string all = bytesFor([](char) { return true; });
  EXPECT_EQ(lowered(all).substr(0x5B), all.substr(0x5B));
}

TEST(Ascii, BytesAreThoseOfTextsWithoutOtherCharacters) {
  using namespace std::string_view_literals;
  EXPECT_EQ(asciiBytes(""), "");
  EXPECT_EQ(asciiBytes("\0az\x7F"sv), "\0az\x7F"sv);
  EXPECT_EQ(asciiBytes("az\x80"), std::nullopt);
  EXPECT_EQ(asciiBytes("\xC3\xA9"), std::nullopt);
}

TEST(Ascii, HexadecimalDigitsHaveTheirValues) {
  constexpr std::string_view inLowerCase = "0123456789abcdef";
  for (unsigned value = 0; value < inLowerCase.size(); ++value) {
    const char digit = inLowerCase[value];
    const char capital = digit >= 'a' ? static_cast<char>(digit - 'a' + 'A') : digit;
    EXPECT_EQ(hexadecimalDigit(digit), static_cast<int>(value));
    EXPECT_EQ(hexadecimalDigit(capital), static_cast<int>(value));
    EXPECT_EQ(hexadecimalCharacter(value), digit);
  }
  EXPECT_EQ(hexadecimalDigit('g'), -1);
  EXPECT_EQ(hexadecimal("\x01\xFE"), "01fe");
}

}  // namespace
}  // namespace qz::text
