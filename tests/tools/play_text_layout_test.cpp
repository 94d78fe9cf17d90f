// SPDX-License-Identifier: MIT
// Text in the cells of a terminal.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tools/support/text_layout.hpp"

namespace qz::tools {
namespace {

TEST(PlayTextLayout, WidthIsThatOfATerminal) {
  const struct {
    const char* what;
    std::string text;
    std::size_t width;
  } cases[] = {
      {"nothing", "", 0},
      {"ASCII", "Next", 4},
      {"two bytes a character", "größer", 6},
      {"a combining mark stands on the character before", "e\u0301", 1},
      {"a wide character", "次へ", 4},
      {"an emoji", "\U0001F600", 2},
      {"the last column before the wide ones", "\u10FF", 1},
      {"a byte that is not valid UTF-8 is one column", "a\xFFz", 3},
      {"a sequence that ends too early", "a\xE2\x82", 3},
      {"a longer form than need be", "\xC0\xAF", 2},
      {"half a surrogate pair", "\xED\xA0\x80", 3},
      {"beyond the last character", "\xF4\x90\x80\x80", 4},
  };
  for (const auto& c : cases) EXPECT_EQ(displayWidth(c.text), c.width) << c.what;
}

TEST(PlayTextLayout, WhatDisturbsATerminalIsWrittenOut) {
  const struct {
    const char* what;
    std::string text;
    std::string shown;
  } cases[] = {
      {"an escape sequence", "\x1b[31mred", "\\u{1b}[31mred"},
      {"a carriage return", "a\r\nb", "a\\u{d}\nb"},
      {"the last control character", "\x7f", "\\u{7f}"},
      {"a control character beyond ASCII", "\u0085", "\\u{85}"},
      // NOLINTNEXTLINE(misc-misleading-bidirectional): misleading on purpose
      {"a change of direction", "\u202Eabc", "\\u{202e}abc"},
      {"a tab", "a\tb", "a b"},
      {"the separators end a line", "a\u2028b\u2029c\nd", "a\nb\nc\nd"},
      {"no UTF-8", "a\xFF", "a\uFFFD"},
      {"text stays", "größer 次へ", "größer 次へ"},
  };
  for (const auto& c : cases) EXPECT_EQ(printable(c.text), c.shown) << c.what;
}

TEST(PlayTextLayout, QuotedTextIsOneLine) {
  EXPECT_EQ(quote("one\ntwo"), "“one\\ntwo”");
  EXPECT_EQ(oneLine("one\ntwo\x1b"), "one\\ntwo\\u{1b}");
  EXPECT_EQ(quote(""), "“”");
}

TEST(PlayTextLayout, TextWraps) {
  using Lines = std::vector<std::string>;
  const struct {
    const char* what;
    std::string text;
    std::size_t width;
    Lines lines;
  } cases[] = {
      {"what fits stays", "one two", 7, {"one two"}},
      {"an empty text is one line", "", 5, {""}},
      {"at the last space that fits", "one two three", 9, {"one two", "three"}},
      {"at a space just behind the width", "one two three", 7, {"one two", "three"}},
      {"a long word is cut", "abcdefgh", 3, {"abc", "def", "gh"}},
      {"at line ends", "a\n\nb", 5, {"a", "", "b"}},
      {"between wide characters", "次へ次へ", 5, {"次へ", "次へ"}},
      {"a character wider than the width", "次へ", 1, {"次", "へ"}},
  };
  for (const auto& c : cases) EXPECT_EQ(wrap(c.text, c.width), c.lines) << c.what;
}

TEST(PlayTextLayout, PaddingCountsColumns) {
  EXPECT_EQ(padRight("次", 4), "次  ");
  EXPECT_EQ(padLeft("é", 3), "  é");
  EXPECT_EQ(padRight("longer", 3), "longer");
}

}  // namespace
}  // namespace qz::tools
