// SPDX-License-Identifier: MIT
// The HTML reader: lists, tables, alignment and indents.
#include <gtest/gtest.h>

#include <array>
#include <string>

#include "tests/styled_text/reading.hpp"

namespace qz {

namespace {

using namespace styled_text_tests;

TEST(HtmlLists, MarkAndIndentTheirItems) {
  expectRuns(std::to_array<Case>({
      {"<ul><li>a</li><li>b</li></ul>c", "\t\u2022\ta\n\t\u2022\tb\n{indent 0/36}|c"},
      {"<ol><li>a</li><li>b</li></ol>", "\t1.\ta\n\t2.\tb\n{indent 0/36}"},
      {"<ul><li>a<p>b</p></ul>", "\t\u2022\ta\n{indent 0/36}|b\n{indent 36/36}"},
      {"<ul>a<li>b</ul>", "a\n{indent 36/36}|\t\u2022\tb\n{indent 0/36}"},
      {"<ol><li>a<ol><li>b</ol><li>c</ol>",
       "\t1.\ta\n{indent 0/36}|\t1.\tb\n{indent 36/72}|\t2.\tc\n{indent 0/36}"},
      {"<ul><li><b>a</b></ul>", "\t\u2022\t{indent 0/36}|a{bold indent 0/36}|\n{indent 0/36}"},
      {"<blockquote><ul><li>a</ul></blockquote>", "\t\u2022\ta\n{indent 36/72}"},
      {"<li>a", "\t\u2022\ta\n"},
  }));
}

TEST(HtmlLists, ChangeTheirBulletsByLevel) {
  expectRuns(std::to_array<Case>({
      {"<ul><li>a<ul><li>b<ul><li>c<ul><li>d</ul></ul></ul></ul>",
       "\t\u2022\ta\n{indent 0/36}|\t\u25E6\tb\n{indent 36/72}|\t\u25AA\tc\n{indent "
       "72/108}|\t\u25AA\td\n{indent 108/144}"},
      {"<ol><li>a<ul><li>b</ul></ol>", "\t1.\ta\n{indent 0/36}|\t\u25E6\tb\n{indent 36/72}"},
      {"<dir><li>a</dir><menu><li>b</menu>", "\t\u2022\ta\n\t\u2022\tb\n{indent 0/36}"},
  }));
}

TEST(HtmlLists, NumberTheirItems) {
  const struct {
    const char* html;
    const char* text;
  } cases[] = {
      {"<ol start=5><li>a<li>b</ol>", "\t5.\ta\n\t6.\tb\n"},
      {"<ol start=-1><li>a<li>b<li>c</ol>", "\t-1.\ta\n\t0.\tb\n\t1.\tc\n"},
      {"<ol start=x><li>a</ol>", "\t1.\ta\n"},
      {"<ol start=99999999999><li>a</ol>", "\t1.\ta\n"},
      {"<ol start=2147483647><li>a<li>b</ol>", "\t2147483647.\ta\n\t2147483648.\tb\n"},
      {"<ol><li value=3>a<li>b<li value=x>c</ol>", "\t3.\ta\n\t4.\tb\n\t5.\tc\n"},
      {"<ol type=a><li>a<li value=26>b<li>c<li value=703>d</ol>",
       "\ta.\ta\n\tz.\tb\n\taa.\tc\n\taaa.\td\n"},
      {"<ol type=A start=2><li>a</ol>", "\tB.\ta\n"},
      {"<ol type=i start=4><li>a<li value=1998>b</ol>", "\tiv.\ta\n\tmcmxcviii.\tb\n"},
      {"<ol type=I><li value=3999>a<li>b</ol>", "\tMMMCMXCIX.\ta\n\t4000.\tb\n"},
      {"<ol type=a start=0><li>a</ol>", "\t0.\ta\n"},
      {"<ol type=i start=-3><li>a</ol>", "\t-3.\ta\n"},
      {"<ol><li type=A>a<li type=disc>b<li>c</ol>", "\tA.\ta\n\t\u2022\tb\n\t3.\tc\n"},
      {"<ul type=SQUARE><li>a<li type=circle>b<li type=1>c<li type=x>d</ul>",
       "\t\u25AA\ta\n\t\u25E6\tb\n\t3.\tc\n\t\u25AA\td\n"},
  };
  for (const auto& [html, text] : cases) EXPECT_EQ(read(html).string(), text) << html;
}

TEST(HtmlLists, CountInRomanNumerals) {
  const struct {
    const char* value;
    const char* marker;
  } cases[] = {
      {"1", "i"},
      {"2", "ii"},
      {"3", "iii"},
      {"4", "iv"},
      {"5", "v"},
      {"6", "vi"},
      {"9", "ix"},
      {"10", "x"},
      {"39", "xxxix"},
      {"40", "xl"},
      {"49", "xlix"},
      {"50", "l"},
      {"89", "lxxxix"},
      {"90", "xc"},
      {"99", "xcix"},
      {"100", "c"},
      {"399", "cccxcix"},
      {"400", "cd"},
      {"499", "cdxcix"},
      {"500", "d"},
      {"899", "dcccxcix"},
      {"900", "cm"},
      {"999", "cmxcix"},
      {"1000", "m"},
      {"3888", "mmmdccclxxxviii"},
      {"3999", "mmmcmxcix"},
  };
  for (const auto& [value, marker] : cases) {
    const std::string html = joined({"<ol type=i><li value=", value, ">a</ol>"});
    EXPECT_EQ(read(html).string(), joined({"\t", marker, ".\ta\n"})) << html;
  }
}

TEST(HtmlLists, PutTheFirstBlockBesideTheMarker) {
  const struct {
    const char* html;
    const char* text;
  } cases[] = {
      {"<ul><li><p>a</p><p>b</p></ul>", "\t\u2022\ta\nb\n"},
      {"<ul><li><div><p>a</div>b</ul>", "\t\u2022\ta\nb\n"},
      {"<ul><li></li><li></li></ul>x", "\t\u2022\t\n\t\u2022\t\nx"},
      {"<ul><li><ul><li>a</ul></ul>", "\t\u2022\t\n\t\u25E6\ta\n"},
      {"<ul><li><p></p></ul>x", "\t\u2022\t\nx"},
      {"<ul><li><pre>a\nb</pre></ul>", "\t\u2022\ta\nb\n"},
      {"<ul><li><table><tr><td>a<td>b</table></ul>", "\t\u2022\ta\tb\n"},
  };
  for (const auto& [html, text] : cases) EXPECT_EQ(read(html).string(), text) << html;
}

TEST(HtmlTables, AreALineARowAndATabBetweenCells) {
  const struct {
    const char* html;
    const char* text;
  } cases[] = {
      {"<table><tr><td>a</td><td>b</td></tr><tr><td>c</td></tr></table>d", "a\tb\nc\nd"},
      {"x<table>\n <tr>\n  <td> a </td>\n  <td> b\n<tr> <td>c\n</table>", "x\na \tb \nc \n"},
      {"<table><thead><tr><th>a<tbody><tr><td>b<tfoot><tr><td>c</table>", "a\nb\nc\n"},
      {"<table><tr><td></td><td></td><td>b<tr><td>c<td></table>d", "\t\tb\nc\t\nd"},
      {"<table><tr><td><p>a</p></td><td><p>b</p></td></tr></table>", "a\nb\n"},
      {"<table><tr><td>a<td><p>b</p><td>c</table>", "a\tb\nc\n"},
      {"<table><caption>t</caption><tr><td>a</table>", "t\na\n"},
      {"<table><td>a<td>b<tr><td>c</table>", "a\tb\nc\n"},
      {"<table><tr><td>a<table><tr><td>b<td>c</table>d</table>", "a\nb\tc\nd\n"},
      {"<table><tr><td>a<td><table><tr><td>b</table><td>c</table>", "a\tb\nc\n"},
      {"<table><tr></tr></table>x", "x"},
  };
  for (const auto& [html, text] : cases) EXPECT_EQ(read(html).string(), text) << html;
}

TEST(HtmlAlignment, IsThatOfTheBlock) {
  expectRuns(std::to_array<Case>({
      {"<center>x</center>y", "x\n{center}|y"},
      {"a<center>x</center>", "a\n|x\n{center}"},
      {"<table><tr><th>x</table>", "x{bold center}|\n{center}"},
      {"<table><caption>x</caption></table>", "x\n{center}"},
      {"<p align=center>x<p align=RIGHT>y<p align=justify>z",
       "x\n{center}|y\n{right}|z\n{justified}"},
      {"<div align=center><p>x<p align=left>y</div>", "x\n{center}|y\n{left}"},
      {"<h1 align=center>x</h1>", "x\n{24 bold center}"},
      {"<table align=center><tr><td>x</table>", "x\n{center}"},
      {"<table><tr align=right><td>x</table>", "x\n{right}"},
      {"<table><tr><td align=right>x</table>", "x\n{right}"},
      {"<p align=nowhere>x", "x\n"},
      {"<p style='text-align:center'>x", "x\n{center}"},
      {"<p align=left style='text-align:right'>x", "x\n{right}"},
      {"<body style='text-align:center'>x<p>y", "x\ny\n{center}"},
      {"<center>x<p style='text-align:start'>y", "x\n{center}|y\n"},
      {"<span style='text-align:center'>x</span>", "x"},
      {"<span align=center>x</span>", "x"},
  }));
}

TEST(HtmlIndents, AddUp) {
  expectRuns(std::to_array<Case>({
      {"<blockquote>x</blockquote>y", "x\n{indent 36/36}|y"},
      {"<blockquote><blockquote>x", "x\n{indent 72/72}"},
      {"<dl><dt>a<dd>b<dt>c</dl>", "a\n|b\n{indent 36/36}|c\n"},
      {"<blockquote><center>x", "x\n{center indent 36/36}"},
  }));
}

// Code that shows the text may ask any character of a paragraph for its layout.
TEST(HtmlAlignment, OfANewLineIsThatOfTheParagraphItEnds) {
  expectRuns(std::to_array<Case>({
      {"<table><tr><td align=center>x<td>y</table>", "x{center}|\ty|\n{center}"},
      {"<ul><li><p align=center>x</ul>",
       "\t\u2022\t{indent 0/36}|x{center indent 0/36}|\n{indent 0/36}"},
      {"<ul><li>a<pre>b\nc</pre></ul>",
       "\t\u2022\ta\n{indent 0/36}|b\nc\n{Courier fixed indent 36/36}"},
  }));
}

}  // namespace

}  // namespace qz
