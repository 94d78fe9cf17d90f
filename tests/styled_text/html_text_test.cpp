// SPDX-License-Identifier: MIT
// The HTML reader: the text that a document turns into.
#include <gtest/gtest.h>

#include <array>
#include <string>

#include "tests/styled_text/reading.hpp"

namespace qz {

namespace {

using namespace styled_text_tests;

struct TextCase {
  const char* html;
  const char* text;
};

template <std::size_t N>
void expectTexts(const std::array<TextCase, N>& cases) {
  for (const auto& [html, text] : cases) {
    const toolkit::AttributedString styled = read(html);
    EXPECT_EQ(styled.string(), text) << html;
    expectSoundRuns(styled);
  }
}

TEST(HtmlText, CollapsesWhiteSpace) {
  expectTexts(std::to_array<TextCase>({
      {"a b", "a b"},
      {"a \t\n\r\f b", "a b"},
      {"a\nb", "a b"},
      {"a <b> b</b>", "a b"},
      {"a<b> </b> <i>\n</i>b", "a b"},
      {"a&#32;&#9; &#10;b", "a b"},
      {"a\vb", "a\vb"},
  }));
}

TEST(HtmlText, DropsWhiteSpaceAtTheStartOfALine) {
  expectTexts(std::to_array<TextCase>({
      {" a", "a"},
      {"\n<p>\n a</p>\n<p> b</p>\n", "a\nb\n"},
      {"a<br> b", "a\nb"},
      {"<p>a<br>\n b</p>", "a\u2028b\n"},
      {"<ul> <li> a</li> </ul> b", "\t\u2022\ta\nb"},
      {"  ", ""},
  }));
}

TEST(HtmlText, KeepsSpacesThatCount) {
  expectTexts(std::to_array<TextCase>({
      {"a ", "a "},
      {"a \n", "a "},
      {"a <b> ", "a "},
      {"a&nbsp;&nbsp;b", "a\u00A0\u00A0b"},
      {"a&nbsp; &#160;b", "a\u00A0 \u00A0b"},
      {"&nbsp;a", "\u00A0a"},
      {"<p>&nbsp;</p>", "\u00A0\n"},
      {"a <p>b </p>", "a \nb \n"},
  }));
}

TEST(HtmlText, OpensAndClosesEveryBlockWithANewLine) {
  constexpr std::array blocks = {
      "p",     "div", "h1",     "h2", "h3", "h4",         "h5", "h6",   "ul",  "ol",   "pre",
      "table", "tr",  "center", "dl", "dt", "blockquote", "dd", "form", "dir", "menu", "fieldset"};
  for (const std::string_view name : blocks) {
    const std::string element = joined({"<", name, ">x</", name, ">"});
    EXPECT_EQ(read(element).string(), "x\n") << element;
    EXPECT_EQ(read(joined({"a", element, "b"})).string(), "a\nx\nb") << element;
    EXPECT_EQ(read(joined({"a<br>", element, element})).string(), "a\nx\nx\n") << element;
    EXPECT_EQ(read(joined({"<div>", element, "</div>"})).string(), "x\n") << element;
  }
  EXPECT_EQ(read("a<li>x</li>b").string(), "a\n\t\u2022\tx\nb");
}

TEST(HtmlText, AddsNoNewLineElsewhere) {
  expectTexts(std::to_array<TextCase>({
      {"x", "x"},
      {"<body>x</body>", "x"},
      {"<html><body>x</body></html>", "x"},
      {"a<body>b", "ab"},
      {"a<span>b</span>c", "abc"},
      {"a<address>b</address>c", "abc"},
      {"a<td>b</td>c", "abc"},
      {"<p></p>", ""},
      {"<div><p></p></div>", ""},
  }));
}

TEST(HtmlText, BreaksLines) {
  expectTexts(std::to_array<TextCase>({
      {"a<br>b", "a\nb"},
      {"a<br><br/>b", "a\n\nb"},
      {"<br>", "\n"},
      {"<div>a<br>b</div>", "a\nb\n"},
      {"<td>a<br>b</td>", "a\nb"},
      {"<p>a<br>b</p>", "a\u2028b\n"},
      {"<p><b>a<br><br>b</b></p>", "a\u2028\u2028b\n"},
      {"<ul><li>a<br>b</ul>", "\t\u2022\ta\u2028b\n"},
      {"<li><div>a<br>b</div></li>", "\t\u2022\ta\u2028b\n"},
      {"<h1>a<br>b</h1>", "a\u2028b\n"},
      {"<h6>a<br>b</h6>c<br>d", "a\u2028b\nc\nd"},
      {"<p>a</p>b<br>c", "a\nb\nc"},
      {"<p>a<br></p>", "a\u2028\n"},
  }));
}

TEST(HtmlText, KeepsWhatIsPreformatted) {
  expectTexts(std::to_array<TextCase>({
      {"<pre>a  b\n\tc</pre>", "a  b\n\tc\n"},
      {"<pre>\na\n</pre>b", "a\nb"},
      {"<pre>\r\n\na\r\nb\rc</pre>", "\na\nb\nc\n"},
      {"<pre>\ra</pre>", "a\n"},
      {"<pre><b>\na</b></pre>", "\na\n"},
      {"<pre> a </pre> b", " a \nb"},
      {"x<pre>  <i> a</i></pre>", "x\n   a\n"},
      {"<pre>a<!-- -->\nb</pre>", "a\nb\n"},
      {"<pre>a\n</pre> b", "a\nb"},
  }));
}

TEST(HtmlText, QuotesInTurns) {
  expectTexts(std::to_array<TextCase>({
      {"<q>a</q>", "\u201Ca\u201D"},
      {"<q>a <q>b <q>c</q></q></q>", "\u201Ca \u2018b \u201Cc\u201D\u2019\u201D"},
      {"<q>a</q> <q>b</q>", "\u201Ca\u201D \u201Cb\u201D"},
      {"<p><q>a<q>b</p>c", "\u201Ca\u2018b\u2019\u201D\nc"},
      {"<q>a", "\u201Ca\u201D"},
      {"a</q>", "a"},
  }));
}

TEST(HtmlText, PutsACharacterForImagesAndALineForRules) {
  expectTexts(std::to_array<TextCase>({
      {"a <img src='x.png' alt='picture'> b", "a \uFFFC b"},
      {"<img><img>", "\uFFFC\uFFFC"},
      {"a<hr>b", "a\n\nb"},
      {"<p>a</p><hr><p>b</p>", "a\n\nb\n"},
      {"<p>a<hr>b", "a\n\nb"},
  }));
}

TEST(HtmlText, DropsWhatIsNotShown) {
  expectTexts(std::to_array<TextCase>({
      {"<head>x</head>y", "y"},
      {"<head><title>x</title><meta name=a></head>y", "y"},
      {"<html><head>x<body>y", "y"},
      {"<head><title>x</title><p>y", "y\n"},
      {" \n<head>x</head>y", "y"},
      {"<html lang=en> <meta name=a><head>x</head>y", "y"},
      {"a<title>x <b>y</title>b", "ab"},
      {"a<script>if (x < y) { '<p>' }</SCRIPT >b", "ab"},
      {"a<style>b { c: </stylex> </style>b", "ab"},
      {"a<script>b", "a"},
      {"a<!-- <b>x</b> -- > -->b<!---->c<!-->d<!--->e<!-- x --!>f", "abcdef"},
      {"a<!-- b --->c", "ac"},
      {"a<!-- b", "a"},
      {"<!DOCTYPE html PUBLIC \"-//W3C//DTD HTML 4.01//EN\">a", "a"},
      {"a<?xml b?>c<![CDATA[d]]>e</>f</ x>g<!>h", "acefgh"},
  }));
}

TEST(HtmlText, IsAbsentOnlyForNothing) {
  EXPECT_FALSE(toolkit::attributedStringFromHTML("", Catalogue()).has_value());
  EXPECT_EQ(read("<html><body></body></html>"), toolkit::AttributedString());
  EXPECT_EQ(read(" "), toolkit::AttributedString());
}

}  // namespace

}  // namespace qz
