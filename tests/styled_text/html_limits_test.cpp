// SPDX-License-Identifier: MIT
// The HTML reader on hostile input: nothing fails, nothing is lost, and time and memory are
// proportional to the input.
#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <ctime>
#include <random>
#include <string>
#include <string_view>
#include <vector>

#include "tests/end_of_memory.hpp"
#include "tests/styled_text/reading.hpp"

namespace qz {

namespace {

using namespace styled_text_tests;

std::string repeated(const std::string& piece, std::size_t size) {
  std::string text;
  while (text.size() < size) text += piece;
  return text;
}

/// True if `text` is well-formed UTF-8 without surrogates.
bool isUtf8(std::string_view text) {
  while (!text.empty()) {
    const auto lead = static_cast<unsigned char>(text.front());
    const std::size_t length = lead < 0x80 ? 1 : lead < 0xE0 ? 2 : lead < 0xF0 ? 3 : 4;
    if ((lead >= 0x80 && lead < 0xC2) || lead > 0xF4 || length > text.size()) return false;
    for (std::size_t i = 1; i < length; ++i) {
      if ((static_cast<unsigned char>(text[i]) & 0xC0U) != 0x80) return false;
    }
    if (lead == 0xED && static_cast<unsigned char>(text[1]) >= 0xA0) return false;
    text.remove_prefix(length);
  }
  return true;
}

void expectSound(std::string_view html) {
  const Catalogue fonts;
  const auto text = toolkit::attributedStringFromHTML(html, fonts);
  if (html.empty()) return;
  ASSERT_TRUE(text.has_value());
  expectSoundRuns(*text);
  EXPECT_TRUE(isUtf8(text->string()));
  for (const toolkit::TextRun& run : text->runs()) {
    ASSERT_TRUE(run.attributes.font.has_value());
    EXPECT_GE(run.attributes.font->size, 1);
    EXPECT_LE(run.attributes.font->size, 1000);
  }
}

constexpr std::array pieces = {"<b>",
                               "</b>",
                               "<i>",
                               "</i>",
                               "<p>",
                               "</p>",
                               "<div align=center>",
                               "</div>",
                               "<ul>",
                               "</ul>",
                               "<ol start=-3 type=i>",
                               "</ol>",
                               "<li value=9>",
                               "</li>",
                               "<table>",
                               "</table>",
                               "<tr>",
                               "</tr>",
                               "<td>",
                               "</td>",
                               "<th>",
                               "<tbody>",
                               "<caption>",
                               "<q>",
                               "</q>",
                               "<big>",
                               "</big>",
                               "<small>",
                               "<sup>",
                               "</sub>",
                               "<pre>",
                               "</pre>",
                               "<h1>",
                               "</h6>",
                               "<br>",
                               "<hr>",
                               "<img>",
                               "<dl>",
                               "<dd>",
                               "</dl>",
                               "<a href=x>",
                               "<a>",
                               "</a>",
                               "<body text=red link=lime>",
                               "</body>",
                               "<html>",
                               "<head>",
                               "</head>",
                               "<title>",
                               "</title>",
                               "<script>",
                               "</script>",
                               "<!--",
                               "-->",
                               "<!x",
                               "<?",
                               "</",
                               "<",
                               ">",
                               "&",
                               "&eacute;",
                               "&lt",
                               "&#",
                               "&#x1F600;",
                               "&#55296;",
                               ";",
                               "\"",
                               "'",
                               "=",
                               " ",
                               "\n",
                               "\r\n",
                               "x",
                               "word ",
                               "<font color=",
                               "<font face='Nope,Arial' size=+1>",
                               "</font>",
                               "<span style='font-size:",
                               "3em;color:#f",
                               "\">",
                               "'>",
                               "<center>",
                               "</center>",
                               "<blockquote>",
                               "\xE9\x80"};

TEST(HtmlLimits, ReadAnything) {
  std::mt19937 random(401);
  for (int round = 0; round < 3000; ++round) {
    std::string html;
    for (auto count = random() % 60; count > 0; --count) {
      if (random() % 8 == 0) {
        html += static_cast<char>(random() % 256);
      } else {
        html += pieces.at(random() % pieces.size());
      }
    }
    expectSound(html);
    if (HasFailure()) FAIL() << html;
  }
}

TEST(HtmlLimits, ReadEveryBeginningOfADocument) {
  const std::string html =
      "<!DOCTYPE x><html><head><title>t</title></head><body link='red'><!-- c --><p align=center>"
      "a &eacute; <b>b <i>c</b>d</i><ul><li>e<li value=3>f</ul><table><tr><td>g<td>h</table>"
      "<a href=\"u&amp;v\">l</a><span style=\"color:#f00;font-size:2em\">m</span>&#x201C;</body>";
  EndOfMemory memory;
  for (std::size_t length = 0; length <= html.size(); ++length) {
    expectSound(memory.holding(std::string_view(html).substr(0, length)));
  }
}

TEST(HtmlLimits, ReadNothingBehindTheEnd) {
  const struct {
    std::string_view html;
    std::string_view behind;
    std::string_view text;
  } cases[] = {
      {"a&", "#65;", "a&"},
      {"a&#", "65;", "a&#"},
      {"a&#6", "5;", "a\x06"},
      {"a&#x", "41;", "a&#x"},
      {"a&am", "p;", "a&am"},
      {"a&notin", ";", "a\u00ACin"},
      {"a<", "b>c", "a<"},
      {"a</", "b>c", "a</"},
      {"a<b", ">c", "a"},
      {"a<b x='", "'>c", "a"},
      {"a<!--", "-->b", "a"},
      {"a<!-- --", ">b", "a"},
      {"a<script>b</", "script>c", "a"},
      {"<pre>\n", "a", ""},
  };
  for (const auto& [html, behind, text] : cases) {
    const std::string whole = joined({html, behind});
    EXPECT_EQ(read(std::string_view(whole).substr(0, html.size())).string(), text) << whole;
    EXPECT_NE(read(whole).string(), text) << whole;
  }
}

// However inline elements are opened and closed, the words between them stay.
TEST(HtmlLimits, LoseNoText) {
  constexpr std::array names = {"b", "i", "u", "font", "a", "span", "big", "sup", "cite", "tt"};
  std::mt19937 random(1998);
  for (int round = 0; round < 300; ++round) {
    std::string html;
    std::string words;
    for (int i = 0; i < 400; ++i) {
      const std::string word(1 + random() % 3, static_cast<char>('a' + random() % 26));
      html += std::string(random() % 3 == 0 ? "</" : "<") + names.at(random() % names.size()) + ">";
      html += word;
      words += word;
    }
    ASSERT_EQ(read(html).string(), words) << html;
  }
}

TEST(HtmlLimits, BoundNestedSizes) {
  EXPECT_EQ(runsText(read(repeated("<big>", 1000) + "x")), "x{1000}");
  EXPECT_EQ(runsText(read(repeated("<small>", 1000) + "x")), "x{1}");
  const auto text = read(repeated("<span style='font-size:300%'>", 3000) + "x");
  EXPECT_EQ(runsText(text), "x{1000}");
}

TEST(HtmlLimits, ReadOnBehindTooDeepNesting) {
  const std::string deep = repeated("<div>", 5000);
  EXPECT_EQ(runsText(read(deep + "<b>x</b>y")), "x{bold}|y\n");
  EXPECT_EQ(runsText(read(repeated("<p><b>x", 7000) + "<i>y</i>z")).substr(0, 8), "x{bold}|");
  EXPECT_EQ(read(repeated("<ul><li>", 8000)).string().substr(0, 10), "\t\u2022\t\n\t\u25E6");
  const auto quoted = read(repeated("<q>", 3000) + "x" + repeated("</q>", 4000));
  EXPECT_NE(quoted.string().find('x'), std::string::npos);
}

std::vector<std::string> hostilePieces() {
  std::string misnested = repeated("<b>", 360) + repeated("<i>", 360);
  misnested += repeated("</b>", 480) + repeated("<b>", 360) + repeated("</i>", 480);
  return {"<b>",
          "<b>x</b>y",
          "<ul>",
          "<ul><li>",
          "&",
          "&a",
          "&#1",
          "<",
          "</",
          "<!--",
          "<!--x--",
          "<a href=",
          "<a href='",
          "<script>",
          "</script",
          "<q>",
          "<table><td>",
          "<p><b>x",
          "<font size=+1>x",
          "<br>",
          "</p>",
          "<dl><dd>",
          " ",
          "<sup>x",
          "<title></tit",
          "<b ",
          "<i a=b a=b",
          misnested};
}

double cpuSeconds(const std::string& html) {
  double best = 1e9;
  for (int i = 0; i < 2; ++i) {
    const std::clock_t begin = std::clock();
    toolkit::attributedStringFromHTML(html, Catalogue());
    best = std::min(best, static_cast<double>(std::clock() - begin) / CLOCKS_PER_SEC);
  }
  return best;
}

// Allows sixteen times the input a little more than sixteen times the time; a quadratic reader
// would take 256 times as long. Grows the smaller input until the clock can measure it, or to 64 Ki
// pieces.
bool takesTimeInProportion(const std::string& piece) {
  constexpr double measurable = 0.0005;
  std::size_t size = 1 << 10;
  double few = cpuSeconds(repeated(piece, size));
  for (; few < measurable && size < 1 << 16; few = cpuSeconds(repeated(piece, size))) size *= 2;
  return cpuSeconds(repeated(piece, size * 16)) < std::max(few, measurable) * 80;
}

// A busy machine may slow down one measurement, but not each of five.
TEST(HtmlLimits, TakeTimeInProportion) {
  for (const std::string& piece : hostilePieces()) {
    int attempts = 1;
    while (attempts <= 5 && !takesTimeInProportion(piece)) ++attempts;
    EXPECT_LE(attempts, 5) << piece.substr(0, 20);
  }
}

TEST(HtmlLimits, TakeMemoryAndLookUpsInProportion) {
  constexpr std::size_t size = 1 << 16;
  for (const std::string& piece : hostilePieces()) {
    const Catalogue fonts;
    const auto text = toolkit::attributedStringFromHTML(repeated(piece, size), fonts);
    EXPECT_LE(text->length(), size * 4) << piece.substr(0, 20);
    EXPECT_LE(text->runs().size(), size) << piece.substr(0, 20);
    EXPECT_LE(fonts.lookUps, size) << piece.substr(0, 20);
  }
}

TEST(HtmlLimits, ShareALongAddressAmongTheRunsOfItsLink) {
  const std::string address(1 << 16, 'u');
  const auto text = read("<a href=" + address + ">" + repeated("<b>x</b>y", 1 << 16) + "</a>");
  ASSERT_GT(text.runs().size(), 1000U);
  for (const toolkit::TextRun& run : text.runs()) {
    ASSERT_EQ(&run.attributes.link->address(), &text.runs().front().attributes.link->address());
  }
}

TEST(HtmlLimits, ReadLongAttributes) {
  constexpr std::size_t size = 1 << 16;
  const std::string values[] = {repeated("a ", size),  repeated("a,", size),
                                repeated(";", size),   repeated("color:red;", size),
                                repeated("/*", size),  repeated("&", size),
                                repeated("9", size),   repeated("font-size:9", size),
                                repeated("&#x", size), repeated("rgb(", size)};
  for (const std::string& value : values) {
    for (const std::string_view name : {"style", "color", "face", "size", "href", "x"}) {
      expectSound(joined({"<font ", name, "=\"", value, "\"><a href=\"", value, "\">x"}));
    }
    expectSound(joined({"<ol start='", value, "' type='", value, "'><li value='", value, "'>x"}));
  }
}

}  // namespace

}  // namespace qz
