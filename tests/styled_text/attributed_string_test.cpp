// SPDX-License-Identifier: MIT
// Attributed strings: their runs, their edits, the exceptions they raise.
#include "qz/styled_text/attributed_string.hpp"

#include <gtest/gtest.h>

#include <random>
#include <string>
#include <vector>

#include "qz/toolkit/exception.hpp"
#include "tests/styled_text/reading.hpp"
#include "text/ascii.hpp"

namespace qz {

namespace {

using namespace styled_text_tests;
using toolkit::AttributedString;
using toolkit::Color;
using toolkit::Font;
using toolkit::ParagraphStyle;
using toolkit::TextAttributes;
using toolkit::TextRange;

const Font times{"Times"};
const Font courier{"Courier", 10, false, false, true};

TEST(AttributedString, HasNoRunsWhenEmpty) {
  EXPECT_TRUE(AttributedString().runs().empty());
  EXPECT_TRUE(AttributedString("", {.font = times}).runs().empty());
  AttributedString text;
  text.append("", {.font = times});
  EXPECT_TRUE(text.runs().empty());
  text.addFont(times, {0, 0});
  EXPECT_TRUE(text.runs().empty());
}

TEST(AttributedString, AppendsRunsAndJoinsEqualOnes) {
  AttributedString text("a", {.font = times});
  text.append("b", {.font = times});
  text.append("", {.font = courier});
  text.append("c", {.font = times, .underline = true});
  EXPECT_EQ(text.string(), "abc");
  EXPECT_EQ(runsText(text), "ab|c{underline}");
  text.append(text.string(), {.font = times});
  EXPECT_EQ(runsText(text), "ab|c{underline}|abc");
}

TEST(AttributedString, SetsAnAttributeOverARange) {
  struct {
    TextRange range;
    const char* runs;
  } const cases[] = {
      {{0, 6}, "abc{Courier 10 fixed}|def{Courier 10 fixed underline}"},
      {{0, 0}, "abc|def{underline}"},
      {{6, 0}, "abc|def{underline}"},
      {{1, 1}, "a|b{Courier 10 fixed}|c|def{underline}"},
      {{2, 2}, "ab|c{Courier 10 fixed}|d{Courier 10 fixed underline}|ef{underline}"},
      {{5, 1}, "abc|de{underline}|f{Courier 10 fixed underline}"},
  };
  for (const auto& [range, runs] : cases) {
    AttributedString text("abc", {.font = times});
    text.append("def", {.font = times, .underline = true});
    text.addFont(courier, range);
    EXPECT_EQ(runsText(text), runs);
    expectSoundRuns(text);
  }
}

TEST(AttributedString, JoinsRunsThatAnEditMakesEqual) {
  AttributedString text("ab", {.font = times});
  text.append("cd", {.font = courier});
  text.append("ef", {.font = times});
  text.addFont(times, {2, 2});
  EXPECT_EQ(runsText(text), "abcdef");
}

TEST(AttributedString, SetsColorsAndParagraphStylesToo) {
  AttributedString text("abc", {.font = times});
  text.addForegroundColor(toolkit::colors::red, {0, 1});
  text.addParagraphStyle(ParagraphStyle{.alignment = toolkit::TextAlignment::center}, {0, 3});
  EXPECT_EQ(runsText(text), "a{#ff0000 center}|bc{center}");
}

TEST(AttributedString, RaisesForAnAbsentValueAndChangesNothing) {
  const AttributedString before("abc", {.font = times});
  AttributedString text = before;
  EXPECT_THROW(text.addFont(std::nullopt, {0, 3}), toolkit::InvalidArgumentException);
  EXPECT_THROW(text.addForegroundColor(std::nullopt, {0, 0}), toolkit::InvalidArgumentException);
  EXPECT_THROW(text.addParagraphStyle(std::nullopt, {9, 9}), toolkit::InvalidArgumentException);
  EXPECT_EQ(text, before);
  try {
    text.addFont(std::nullopt, {0, 3});
  } catch (const toolkit::Exception& exception) {
    EXPECT_EQ(exception.reason(),
              "-[NSMutableAttributedString addAttribute:value:range:]: nil value");
  }
}

TEST(AttributedString, RaisesForARangeBeyondTheTextAndChangesNothing) {
  const AttributedString before("abc", {.font = times});
  AttributedString text = before;
  const TextRange beyond[] = {{0, 4}, {3, 1}, {4, 0}, {1, SIZE_MAX}, {SIZE_MAX, 2}};
  for (const TextRange& range : beyond) {
    EXPECT_THROW(text.addFont(courier, range), toolkit::RangeException);
  }
  EXPECT_EQ(text, before);
  try {
    text.addFont(courier, {2, 2});
  } catch (const toolkit::Exception& exception) {
    EXPECT_EQ(exception.reason(),
              "-[NSMutableAttributedString addAttribute:value:range:]: range {2, 2} out of bounds; "
              "text length 3");
  }
}

TEST(AttributedString, NestsEdits) {
  AttributedString text("abc");
  EXPECT_THROW(text.endEditing(), toolkit::RangeException);
  text.beginEditing();
  text.beginEditing();
  text.addFont(courier, {0, 3});
  text.endEditing();
  text.endEditing();
  EXPECT_THROW(text.endEditing(), toolkit::RangeException);
  EXPECT_EQ(runsText(text), "abc{Courier 10 fixed}");
}

TEST(AttributedString, ComparesTextAndAttributesAndNotOpenEdits) {
  const AttributedString text("abc", {.font = times});
  AttributedString same("ab", {.font = times});
  same.beginEditing();
  same.append("c", {.font = times});
  EXPECT_EQ(text, same);
  EXPECT_NE(text, AttributedString("abc"));
  EXPECT_NE(text, AttributedString("abd", {.font = times}));
}

// A text together with its model, which keeps the attributes of every single byte.
struct Modelled {
  AttributedString text;
  std::vector<TextAttributes> model;

  void append(const TextAttributes& attributes) {
    text.append("xx", attributes);
    model.insert(model.end(), 2, attributes);
  }

  void addFont(const Font& font, TextRange range) {
    text.addFont(font, range);
    for (std::size_t i = 0; i < range.length; ++i) model[range.location + i].font = font;
  }

  void addColor(const Color& color, TextRange range) {
    text.addForegroundColor(color, range);
    for (std::size_t i = 0; i < range.length; ++i) {
      model[range.location + i].foregroundColor = color;
    }
  }

  AttributedString expected() const {
    AttributedString result;
    for (const TextAttributes& attributes : model) result.append("x", attributes);
    return result;
  }
};

TEST(AttributedString, KeepsItsInvariantsUnderRandomEdits) {
  std::mt19937 random(1998);
  const Font fonts[] = {times, courier};
  const Color colors[] = {toolkit::colors::red, toolkit::colors::blue};
  Modelled both;
  for (int round = 0; round < 2000; ++round) {
    const std::size_t length = both.model.size();
    const std::size_t location = random() % (length + 1);
    const TextRange range{location, random() % (length - location + 1)};
    switch (random() % 4) {
      case 0:
        both.addFont(fonts[random() % 2], range);
        break;
      case 1:
        both.addColor(colors[random() % 2], range);
        break;
      case 2:
        both.append({.font = fonts[random() % 2]});
        break;
      default:
        if (length > 100) both = {};
    }
    ASSERT_EQ(both.text, both.expected());
    expectSoundRuns(both.text);
  }
}

TEST(Link, SharesItsAddressAmongCopiesAndComparesByIt) {
  const toolkit::Link link = "http://example.com/";
  toolkit::Link other("http://example.org/");
  EXPECT_NE(link, other);
  other = link;
  EXPECT_EQ(&link.address(), &other.address());
  EXPECT_EQ(link, toolkit::Link(std::string("http://example.com/")));
  EXPECT_NE(link, toolkit::Link("http://example.com"));
  const std::string& address = link;
  EXPECT_EQ(address, "http://example.com/");
}

TEST(AsciiBytes, AreAbsentForWhatAsciiLacks) {
  EXPECT_EQ(text::asciiBytes(""), "");
  EXPECT_EQ(text::asciiBytes("a\t\x7f"), "a\t\x7f");
  EXPECT_EQ(text::asciiBytes(std::string("a\0b", 3)), std::string("a\0b", 3));
  EXPECT_EQ(text::asciiBytes("caf\u00e9"), std::nullopt);
  EXPECT_EQ(text::asciiBytes("\x80"), std::nullopt);
}

}  // namespace

}  // namespace qz
