// SPDX-License-Identifier: MIT
// The HTML reader: characters written as references and as bytes.
#include <gtest/gtest.h>

#include <array>
#include <fstream>
#include <string>

#include "tests/styled_text/reading.hpp"

namespace qz {

namespace {

using namespace styled_text_tests;

struct ReferenceCase {
  const char* html;
  const char* text;
};

template <std::size_t N>
void expectTexts(const std::array<ReferenceCase, N>& cases) {
  for (const auto& [html, text] : cases) EXPECT_EQ(read(html).string(), text) << html;
}

TEST(HtmlReferences, NameTheEntitiesOfHtml4) {
  expectTexts(std::to_array<ReferenceCase>({
      {"&lt;b&gt; &amp;amp; &quot;", "<b> &amp; \""},
      {"&iexcl;&copy;&reg;&yuml;", "\u00A1\u00A9\u00AE\u00FF"},
      {"&Eacute;&eacute;&AElig;&aelig;", "\u00C9\u00E9\u00C6\u00E6"},
      {"&Alpha;&alpha;&thetasym;&piv;&sigmaf;", "\u0391\u03B1\u03D1\u03D6\u03C2"},
      {"&OElig;&Scaron;&Yuml;&fnof;&circ;&tilde;", "\u0152\u0160\u0178\u0192\u02C6\u02DC"},
      {"&ensp;&zwj;&rlm;", "\u2002\u200D\u200F"},
      {"&ndash;&mdash;&lsquo;&bdquo;&dagger;&Dagger;", "\u2013\u2014\u2018\u201E\u2020\u2021"},
      {"&bull;&hellip;&prime;&Prime;&euro;&trade;", "\u2022\u2026\u2032\u2033\u20AC\u2122"},
      {"&larr;&lArr;&forall;&there4;&sup;&sup1;", "\u2190\u21D0\u2200\u2234\u2283\u00B9"},
      {"&lang;&rang;&loz;&spades;&diams;", "\u2329\u232A\u25CA\u2660\u2666"},
  }));
}

TEST(HtmlReferences, StayAsWrittenWhenTheirNameIsUnknown) {
  expectTexts(std::to_array<ReferenceCase>({
      {"&nosuch;", "&nosuch;"},
      {"&Copy;", "&Copy;"},
      {"&LT;", "&LT;"},
      {"&apos;", "&apos;"},
      {"&ampx;", "&ampx;"},
      {"&;", "&;"},
      {"& ", "& "},
      {"a&", "a&"},
      {"a && b", "a && b"},
      {"&#;&#x;&#xg;&#a;", "&#;&#x;&#xg;&#a;"},
      {"&<b>x</b>", "&x"},
  }));
}

TEST(HtmlReferences, OfLatin1DoWithoutTheSemicolon) {
  expectTexts(std::to_array<ReferenceCase>({
      {"&copy 1998", "\u00A9 1998"},
      {"&copy1998", "\u00A91998"},
      {"&eacutet&eacute", "\u00E9t\u00E9"},
      {"a&nbspb", "a\u00A0b"},
      {"&lt&gt&amp", "<>&"},
      {"&ampamp", "&amp"},
      {"&notin", "\u00ACin"},
      {"&notin;", "\u2209"},
      {"&sup1&supx", "\u00B9&supx"},
      {"&alpha x", "&alpha x"},
  }));
}

TEST(HtmlReferences, CountInDecimalAndHexadecimal) {
  expectTexts(std::to_array<ReferenceCase>({
      {"&#65;&#x42;&#X43;&#0068;", "ABCD"},
      {"&#233;&#xe9;&#xE9;", "\u00E9\u00E9\u00E9"},
      {"&#8364;&#x1F600;&#x10FFFF;", "\u20AC\U0001F600\U0010FFFF"},
      {"&#65&#66x&#x43 &#x44g", "ABxC Dg"},
      {"&#0;&#xD800;&#xdfff;&#x110000;", "\uFFFD\uFFFD\uFFFD\uFFFD"},
      {"&#99999999999999999999;&#x100000041;", "\uFFFD\uFFFD"},
  }));
}

TEST(HtmlReferences, From128To159AreWindows1252) {
  expectTexts(std::to_array<ReferenceCase>({
      {"&#128;&#130;&#131;&#132;&#133;", "\u20AC\u201A\u0192\u201E\u2026"},
      {"&#134;&#135;&#136;&#137;&#138;", "\u2020\u2021\u02C6\u2030\u0160"},
      {"&#139;&#140;&#142;&#145;&#146;", "\u2039\u0152\u017D\u2018\u2019"},
      {"&#147;&#148;&#149;&#150;&#151;", "\u201C\u201D\u2022\u2013\u2014"},
      {"&#152;&#153;&#154;&#155;&#156;", "\u02DC\u2122\u0161\u203A\u0153"},
      {"&#158;&#x9F;", "\u017E\u0178"},
      {"&#129;&#141;", "\u0081\u008D"},
      {"&#160;&#161;", "\u00A0\u00A1"},
  }));
}

TEST(HtmlReferences, AreReadInAttributes) {
  EXPECT_EQ(runsText(read("<a href='?a=1&amp;b=2&copy;'>x</a>")),
            "x{#0000ee link=?a=1&b=2\u00A9 underline}");
  // In an attribute, a name followed by a letter or "=" is not a reference.
  EXPECT_EQ(runsText(read("<a href='?a&copy=1&copyx=2&lt'>x</a>")),
            "x{#0000ee link=?a&copy=1&copyx=2< underline}");
  EXPECT_EQ(runsText(read("<font face=&quot;Arial&quot; color=&#114;ed>x</font>")),
            "x{Arial #ff0000}");
}

TEST(HtmlBytes, AreReadAsBrowsersReadIso8859) {
  EXPECT_EQ(read("caf\xE9 \x93x\x94").string(), "caf\u00E9 \u201Cx\u201D");
  EXPECT_EQ(read("a\xA0 \xA0"
                 "b")
                .string(),
            "a\u00A0 \u00A0b");
  EXPECT_EQ(read(std::string("a\0b", 3)).string(), "ab");
}

TEST(HtmlReferences, NameAllOfHtml4) {
  std::ifstream table(std::string(QZ_TEST_DATA) + "/html-entities.tsv");
  std::string name;
  std::string number;
  int rows = 0;
  for (; table >> name >> number; ++rows) {
    // Compares with the numeric reference to the same character; none is among 128 to 159.
    EXPECT_EQ(read("&" + name + ";").string(), read("&#" + number + ";").string()) << name;
  }
  EXPECT_EQ(rows, 252);
}

}  // namespace

}  // namespace qz
