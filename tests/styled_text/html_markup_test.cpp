// SPDX-License-Identifier: MIT
// The HTML reader: markup that is unclosed, stray, misnested or cut short.
#include <gtest/gtest.h>

#include <array>
#include <string>

#include "tests/styled_text/reading.hpp"

namespace qz {

namespace {

using namespace styled_text_tests;

TEST(HtmlMarkup, IgnoresCase) {
  expectRuns(std::to_array<Case>({
      {"<B>x</b><FONT COLOR=RED>y</Font>", "x{bold}|y{#ff0000}"},
      {"<Ol StArT=2><lI>x</OL>", "\t2.\tx\n{indent 0/36}"},
  }));
}

TEST(HtmlMarkup, ReadsAttributesHoweverWritten) {
  expectRuns(std::to_array<Case>({
      {"<font color=red size=4>x", "x{13.5 #ff0000}"},
      {"<font color = \"red\"\n\tsize = '4' >x", "x{13.5 #ff0000}"},
      {"<font color='red'size=\"4\"/>x", "x{13.5 #ff0000}"},
      {"<font/color=red /size=4>x", "x{13.5 #ff0000}"},
      {"<font color=red color=lime>x", "x{#ff0000}"},
      {"<font bogus =bogus= \"'>\" color=red>x", "\" color=red>x"},
      {"<font bogus =\"bogus='>\" color=red>x", "x{#ff0000}"},
      {"<a href=a/b/>x</a>", "x{#0000ee link=a/b/ underline}"},
      {"<a title='a>b' href=\"c>d\">x</a>", "x{#0000ee link=c>d underline}"},
      {"<b =x>x", "x{bold}"},
  }));
}

TEST(HtmlMarkup, ClosesParagraphsAndItemsWhereOthersBegin) {
  expectRuns(std::to_array<Case>({
      {"<p align=center>x<p>y", "x\n{center}|y\n"},
      {"<p align=center>x<div>y</div>z", "x\n{center}|y\nz"},
      {"<p align=center><i>x<ul><li>y</ul>",
       "x{italic center}|\n{center}|\t\u2022\t{indent 0/36}|y{italic indent 0/36}|\n{indent 0/36}"},
      {"<p align=center>x<table><tr><td>y</table>", "x\n{center}|y\n"},
      {"<ul><li>a<b>b<li>c</b>d</ul>",
       "\t\u2022\ta{indent 0/36}|b{bold indent 0/36}|\n\t\u2022\t{indent 0/36}|c{bold indent "
       "0/36}|d\n{indent 0/36}"},
      {"<h1>x<h3>y</h1>z", "x\n{24 bold}|y\n{14.04 bold}|z"},
      {"<h1>x</h2>y", "x\n{24 bold}|y"},
  }));
}

TEST(HtmlMarkup, KeepsFormattingThatOverlaps) {
  expectRuns(std::to_array<Case>({
      {"<b>a<i>b</b>c</i>d", "a{bold}|b{bold italic}|c{italic}|d"},
      {"<font color=red>a<b>b</font>c</b>d", "a{#ff0000}|b{bold #ff0000}|c{bold}|d"},
      {"<b>a<p>b</b>c</p>d", "a\nb{bold}|c\nd"},
      {"<p><b>a</p>b<p>c</b>d", "a{bold}|\n|b\nc{bold}|d\n"},
      {"<div><i><b>a</div>b</b>c</i>d", "a{bold italic}|\n|b{bold italic}|c{italic}|d"},
      {"<b><b>a</b>b</b>c", "ab{bold}|c"},
      {"<p><b>a<i>b</p></b>c</i>d", "a{bold}|b{bold italic}|\n|c{italic}|d"},
      {"<p><u>a<b>b</p><p><i>c", "a{underline}|b{bold underline}|\n|c{bold italic underline}|\n"},
      {"<p><b>a</p><img><p>b</p><br>", "a{bold}|\n|\uFFFC\nb\n\n{bold}"},
      {"<a href=u>x<p>y</a>z", "x\ny{#0000ee link=u underline}|z\n"},
  }));
}

TEST(HtmlMarkup, KeepsThreeOfAKindThatOverlap) {
  expectRuns(std::to_array<Case>({
      {"<p><big><big><big>a<p>b", "a{20.74}|\n|b{20.74}|\n"},
      {"<p><big><big><big><big>a<p>b", "a{24.89}|\n|b{20.74}|\n"},
      {"<p><b><b><b><b>a<p>b</b></b>c</b>d", "a{bold}|\n|bc{bold}|d\n"},
      {"<p><font size=1><font size=2><font size=1><font color=red><font size=1><font size=1>a<p>"
       "</font></font></font>b</font>c",
       "a{7.5 #ff0000}|\n|b{7.5}|c{9.75}|\n"},
  }));
}

TEST(HtmlMarkup, EndsOtherElementsWithTheirParents) {
  expectRuns(std::to_array<Case>({
      {"<p><sup>a</p>b", "a{super 1}|\nb"},
      {"<p><span style='color:red'>a</p>b", "a{#ff0000}|\nb"},
      {"<span style='color:red'>a<b>b</span>c</b>", "a{#ff0000}|b{bold #ff0000}|c{bold}"},
      {"<span style='color:red'>a<p>b</span>c", "a\nbc\n{#ff0000}"},
      {"<center>a<blockquote>b</center>c", "a\n{center}|b\n{center indent 36/36}|c"},
      {"<ul><li>a</ul>b</li>c", "\t\u2022\ta\n{indent 0/36}|bc"},
      {"<ul><li>a<ol><li>b</ul>c", "\t\u2022\ta\n{indent 0/36}|\t1.\tb\n{indent 36/72}|c"},
  }));
}

TEST(HtmlMarkup, KeepsFormattingInItsCell) {
  expectRuns(std::to_array<Case>({
      {"<table><tr><td><b>a<td>b</table>c", "a{bold}|\tb\nc"},
      {"<table><tr><td><b>a</table>c", "a{bold}|\nc"},
      {"<p><b>a</p><table><tr><td>b</table>c", "a{bold}|\nb\n|c{bold}"},
      {"<table><tr><td><p><b>a</p></b>b</table></b>c", "a{bold}|\nb\nc"},
      {"<p><b>a</p><table><tr><td>b</b></table>c</b>d", "a{bold}|\nb\n|c{bold}|d"},
      {"<b><table><tr><td>a</b>b</table>c", "ab\nc{bold}"},
      {"<table><tr><td>a</td></div></p></tr></table>b", "a\nb"},
      {"<div><table><tr><td>a</div>b</table>c</div>d", "ab\nc\nd"},
      {"<table><tr><td><ul><li>a<td>b</table>", "\t\u2022\ta\n{indent 0/36}|b\n"},
  }));
}

TEST(HtmlMarkup, IgnoresStrayTags) {
  expectRuns(std::to_array<Case>({
      {"a</b></i></div></li></ul></td></table></q></font></h1>b", "ab"},
      {"</body>a</html>b", "ab"},
      {"a</head>b</title>c</script>d", "abcd"},
      {"a<head>b</head>c", "abc"},
      {"a<head>b", "ab"},
      {"&nbsp;<head>a</head>b", "\u00A0ab"},
      {"<b>a<head>b</b></head>c", "ab{bold}|c"},
      {"<body><head>a</head>b", "ab"},
      {"<b><head>a</head>b", "ab{bold}"},
      {"</p><head>a</head>b", "ab"},
      {"<head>a</head><head>b</head>c", "bc"},
      {"a<head><title>b</title></head>c", "ac"},
      {"a</p>b", "a\nb"},
      {"a</br>b", "a\nb"},
      {"a<unknown x=y>b</unknown>c", "abc"},
      {"a<input><select><option>b</select>", "ab"},
      {"<b>a</body>b", "ab{bold}"},
  }));
}

TEST(HtmlMarkup, TakesForTextWhatIsNoTag) {
  const struct {
    const char* html;
    const char* text;
  } cases[] = {
      {"a < b", "a < b"}, {"a<1>b", "a<1>b"}, {"a<<b>b", "a<b"},    {"1<2<3", "1<2<3"},
      {"a<", "a<"},       {"a</", "a</"},     {"a > b", "a > b"},   {"<>", "<>"},
      {"a<b", "a"},       {"a<b c='", "a"},   {"a<b c=\"x>y", "a"}, {"a</b", "a"},
      {"a<!", "a"},       {"a<?", "a"},       {"a<!-", "a"},        {"a<b<i>b", "ab"},
  };
  for (const auto& [html, text] : cases) EXPECT_EQ(read(html).string(), text) << html;
}

TEST(HtmlMarkup, ReadsTheDocumentsOfScripts) {
  constexpr std::string_view head =
      R"(<!DOCTYPE HTML PUBLIC "-//W3C//DTD HTML 4.01 Transitional//EN" )"
      R"("http://www.w3.org/TR/html4/loose.dtd"><html><head><meta http-equiv="Content-type" )"
      R"(content="text/html; charset=iso-8859-1"></head>)";
  constexpr std::string_view plain = R"(<body bgcolor="#000000">)";
  constexpr std::string_view oneBlank =
      R"(<body bgcolor="#000000" link="#00e5ff" vlink="#00e5ff">)";
  constexpr std::string_view twoBlanks =
      R"(<body bgcolor="#000000" link="#00e5ff"  vlink="#00e5ff">)";
  constexpr std::string_view tail = "</body></html>";
  constexpr std::string_view fragment = R"(<p>See <a href="http://x.org/">this</a>.</p>)";
  EXPECT_EQ(runsText(read(joined({head, plain, fragment, tail}))),
            "See |this{#0000ee link=http://x.org/ underline}|.\n");
  for (const std::string_view body : {oneBlank, twoBlanks}) {
    EXPECT_EQ(runsText(read(joined({head, body, fragment, tail}))),
              "See |this{#00e5ff link=http://x.org/ underline}|.\n");
    EXPECT_EQ(runsText(read(joined({head, body, tail}))), "");
    EXPECT_EQ(runsText(read(joined({head, body, "b", tail}))), "b");
    // A script may contain a whole document.
    const std::string document = joined({head, "<body text=white>b", tail});
    EXPECT_EQ(runsText(read(joined({head, body, document, "\n", tail}))), "b {#ffffff}");
  }
}

}  // namespace

}  // namespace qz
