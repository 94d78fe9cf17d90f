// SPDX-License-Identifier: MIT
// The HTML reader: fonts, colours and the other attributes of letters.
#include <gtest/gtest.h>

#include <array>
#include <string>

#include "tests/styled_text/reading.hpp"

namespace qz {

namespace {

using namespace styled_text_tests;

struct ValueCase {
  const char* value;
  const char* runs;
};

template <std::size_t N>
void expectValues(const std::string& property, const std::array<ValueCase, N>& cases) {
  for (const auto& [value, runs] : cases) {
    const std::string html = "<span style='" + property + ": " + value + "'>x</span>";
    EXPECT_EQ(runsText(read(html)), runs) << html;
  }
}

TEST(HtmlStyle, IsTimes12WhenNothingIsAskedFor) {
  const auto text = read("x");
  ASSERT_EQ(text.runs().size(), 1U);
  EXPECT_EQ(text.runs().front().attributes,
            toolkit::TextAttributes{.font = toolkit::Font{"Times"}});
}

TEST(HtmlStyle, MarksPhrases) {
  expectRuns(std::to_array<Case>({
      {"<b>x</b>y", "x{bold}|y"},
      {"<strong>x</strong>", "x{bold}"},
      {"<i>x</i>", "x{italic}"},
      {"<em>x</em>", "x{italic}"},
      {"<cite>x</cite>", "x{italic}"},
      {"<var>x</var>", "x{italic}"},
      {"<dfn>x</dfn>", "x{italic}"},
      {"<address>x</address>", "x{italic}"},
      {"<u>x</u><ins>y</ins>", "xy{underline}"},
      {"<s>x</s><strike>y</strike><del>z</del>", "xyz{strike}"},
      {"<tt>x</tt><code>y</code>", "xy{Courier fixed}"},
      {"<kbd>x</kbd><samp>y</samp>", "xy{Courier fixed}"},
      {"<pre>x</pre>", "x\n{Courier fixed}"},
      {"x<sup>2</sup>y<sub>i</sub>", "x|2{super 1}|y|i{super -1}"},
      {"<sup>a<sup>b<sub>c</sub></sup></sup>", "a{super 1}|b{super 2}|c{super 1}"},
      {"<b>a<i>b<u>c</u></i></b>", "a{bold}|b{bold italic}|c{bold italic underline}"},
      {"<q><b>x</b></q>", "\u201C|x{bold}|\u201D"},
      {"<b><img></b>", "\uFFFC{bold}"},
      {"a<b> b</b>", "a| b{bold}"},
  }));
}

TEST(HtmlStyle, SetsHeadingsInBoldBySize) {
  expectRuns(std::to_array<Case>({
      {"<h1>x</h1>", "x\n{24 bold}"},
      {"<h2>x</h2>", "x\n{18 bold}"},
      {"<h3>x</h3>", "x\n{14.04 bold}"},
      {"<h4>x</h4>", "x\n{bold}"},
      {"<h5>x</h5>", "x\n{9.96 bold}"},
      {"<h6>x</h6>", "x\n{8.04 bold}"},
      {"<font size=5><h1>x</h1></font>", "x\n{36 bold}"},
  }));
}

TEST(HtmlStyle, TakesTheFirstFaceThatIsKnown) {
  expectRuns(std::to_array<Case>({
      {"<font face=Arial>x</font>y", "x{Arial}|y"},
      {"<font face='Nope, \"Comic Sans MS\", Arial'>x", "x{Comic Sans MS}"},
      {"<font face='Nope'>x", "x"},
      {"<font face=Arial>x<font face=Nope,Never>y", "xy{Arial}"},
      {"<font face=' , ,Courier'>x", "x{Courier fixed}"},
      {"<font face=arial-bold>x<b>y</b><font face=Times>z", "xy{Arial bold}|z"},
      {"<tt>x<font face=Arial>y</font></tt>", "x{Courier fixed}|y{Arial}"},
      {"<span style='font-family: Nope, sans-serif'>x", "x{Helvetica}"},
      {"<span style='font-family: monospace'>x<span style='font-family:Serif'>y",
       "x{Courier fixed}|y"},
      {"<font face=Arial style='font-family: \"Courier\"'>x", "x{Courier fixed}"},
  }));
}

/// Knows every font.
class EveryFont final : public toolkit::Fonts {
 public:
  std::optional<toolkit::Font> fontWithName(std::string_view name, double size) const override {
    return toolkit::Font{std::string(name), size};
  }
};

TEST(HtmlStyle, AsksForFacesAsTheyAreWritten) {
  const auto familyIn = [](std::string_view html) {
    const auto text = toolkit::attributedStringFromHTML(html, EveryFont());
    return text ? text->runs().front().attributes.font->family : "none";
  };
  EXPECT_EQ(familyIn("<tt>x"), "Courier");
  EXPECT_EQ(familyIn("<font face=' , ,Verdana'>x"), "Verdana") << "no face is not asked for";
  EXPECT_EQ(familyIn("<font face='\"Verdana\"'>x"), "Verdana");
  EXPECT_EQ(familyIn("<font face='\", Verdana'>x"), "\"") << "one quote quotes nothing";
}

TEST(HtmlStyle, SizesFontElementsInSevenSteps) {
  expectRuns(std::to_array<Case>({
      {"<font size=1>x", "x{7.5}"},
      {"<font size=2>x", "x{9.75}"},
      {"<font size=3>x", "x"},
      {"<font size=4>x", "x{13.5}"},
      {"<font size=5>x", "x{18}"},
      {"<font size=6>x", "x{24}"},
      {"<font size=' 7 '>x", "x{36}"},
      {"<font size=8>x<font size=0>y<font size=99999999999>z", "x{36}|yz{7.5}"},
      {"<font size=+1>x", "x{13.5}"},
      {"<font size=+1><font size='+2'>x", "x{18}"},
      {"<font size=-1>x", "x{9.75}"},
      {"<font size=-9>x<font size=+9>y", "x{7.5}|y{36}"},
      {"<font size=5>x<font size=large>y<font size=''>z", "xyz{18}"},
      {"<font size=4px>x", "x{13.5}"},
  }));
}

TEST(HtmlStyle, GrowsAndShrinksByAFifthOfTheSmallerSize) {
  expectRuns(std::to_array<Case>({
      {"<big>x<big>y</big></big>z", "x{14.4}|y{17.28}|z"},
      {"<small>x</small>", "x{10}"},
      {"<big><small>x", "x"},
      {"<span style='font-size:larger'>x", "x{14.4}"},
      {"<span style='font-size:smaller'>x", "x{10}"},
  }));
}

TEST(HtmlStyle, ReadsSizesOfCss) {
  expectValues("font-size", std::to_array<ValueCase>({
                                {"14pt", "x{14}"},
                                {"16px", "x"},
                                {"20PX", "x{15}"},
                                {"1.5em", "x{18}"},
                                {".5em", "x{6}"},
                                {"150%", "x{18}"},
                                {"2ex", "x"},
                                {"1in", "x{72}"},
                                {"2.54cm", "x{72}"},
                                {"25.4mm", "x{72}"},
                                {"2pc", "x{24}"},
                                {"2rem", "x{24}"},
                                {"xx-small", "x{6.75}"},
                                {"x-small", "x{7.5}"},
                                {"small", "x{9.75}"},
                                {"medium", "x"},
                                {"Large", "x{13.5}"},
                                {"x-large", "x{18}"},
                                {"xx-large", "x{24}"},
                                {"+14pt", "x{14}"},
                                {"0", "x{1}"},
                                {"0.01pt", "x{1}"},
                                {"99999pt", "x{1000}"},
                            }));
}

TEST(HtmlStyle, PassesOverSizesThatAreNone) {
  for (const std::string size :
       {"14 pt", "14", "-14pt", "pt", "huge", "", "inf", "nanpt", "1e3pt", "+-3pt"}) {
    EXPECT_EQ(runsText(read("<big style='font-size:" + size + "'>x")), "x{14.4}") << size;
  }
}

TEST(HtmlStyle, ReadsTheOtherPropertiesOfFonts) {
  expectRuns(std::to_array<Case>({
      {"<span style='font-weight: bold'>x", "x{bold}"},
      {"<span style='font-weight:Bolder;'>x", "x{bold}"},
      {"<span style='font-weight:700'>x<span style='font-weight:400'>y", "x{bold}|y"},
      {"<span style='font-weight:600'>x<span style='font-weight:500'>y", "x{bold}|y"},
      {"<b style='font-weight: normal'>x", "x"},
      {"<b>x<span style='font-weight:lighter'>y<span style='font-weight:heavy'>z", "x{bold}|yz"},
      {"<b style='font-weight:0'>x<b style='font-weight:1001'>y", "xy{bold}"},
      {"<span style='font-style:italic'>x<i style='font-style:normal'>y", "x{italic}|y"},
      {"<span style='font-style:OBLIQUE'>x<i style='font-style:upright'>y", "xy{italic}"},
      {"<span style='text-decoration:underline line-through'>x", "x{underline strike}"},
      {"<u style='text-decoration:none'>x", "x"},
      {"<u style='text-decoration:wavy'>x", "x{underline}"},
      {"<u style='text-decoration:line-through'>x", "x{strike}"},
      {"<u><span style='text-decoration:none'>x", "x{underline}"},
      {"<a href=u style='text-decoration:none'>x", "x{#0000ee link=u}"},
  }));
}

TEST(HtmlStyle, ReadsInlineStyleSheetsLeniently) {
  expectRuns(std::to_array<Case>({
      {"<span style='color:red;font-weight:bold'>x", "x{bold #ff0000}"},
      {"<span style=' ;; COLOR : Red ! important ; x ; :y; font-style : italic'>x",
       "x{italic #ff0000}"},
      {"<span style='color:red;color:blue;color:nocolor'>x", "x{#0000ff}"},
      {"<span style='/* color:red; */font-weight:/* x */bold/*'>x", "x{bold}"},
      {"<span style='color:red;/*/ color:blue; */'>x", "x{#ff0000}"},
      {"<span style=\"font-family:'A;color:red', Arial; color:blue\">x", "x{Arial #0000ff}"},
      {"<span style='unknown:x;font:bold'>x", "x"},
      {"<p><font color=red>a<p><font color=blue>b", "a{#ff0000}|\n|b{#0000ff}|\n"},
      {"<b style=color:red>x<custom style='color:blue'>y", "xy{bold #ff0000}"},
  }));
}

TEST(HtmlStyle, ReadsColorsOfCss) {
  expectValues("color", std::to_array<ValueCase>({
                            {"#f00", "x{#ff0000}"},
                            {"#00E5ff", "x{#00e5ff}"},
                            {"rgb(1,2,3)", "x{#010203}"},
                            {"RGB( 300 , -5 , 50% )", "x{#ff0080}"},
                            {"rgba(255,0,0,.5)", "x{#ff0000/0.5}"},
                            {"black", "x{#000000}"},
                            {"Silver", "x{#c0c0c0}"},
                            {"gray", "x{#808080}"},
                            {"white", "x{#ffffff}"},
                            {"maroon", "x{#800000}"},
                            {"purple", "x{#800080}"},
                            {"fuchsia", "x{#ff00ff}"},
                            {"green", "x{#008000}"},
                            {"lime", "x{#00ff00}"},
                            {"olive", "x{#808000}"},
                            {"yellow", "x{#ffff00}"},
                            {"navy", "x{#000080}"},
                            {"teal", "x{#008080}"},
                            {"aqua", "x{#00ffff}"},
                            {"aliceblue", "x{#f0f8ff}"},
                            {"LightGoldenrodYellow", "x{#fafad2}"},
                            {"darkslategrey", "x{#2f4f4f}"},
                            {"yellowgreen", "x{#9acd32}"},
                        }));
}

TEST(HtmlStyle, PassesOverColorsThatAreNone) {
  for (const std::string color :
       {"#ff", "#ggg", "ff0000", "rgb(1,2)", "rgb(1,2,3,4,5)", "rgb(1,2,3", "rgb 1,2,3)",
        "hsv(1,2,3)", "rgb(a,b,c)", "rgb(1 2,3,4)", ""}) {
    EXPECT_EQ(runsText(read("<font color=red style='color:" + color + "'>x")), "x{#ff0000}")
        << color;
  }
}

// Unlike CSS, the attributes turn almost any text into a colour.
TEST(HtmlStyle, ReadsColorsOfAttributes) {
  const struct {
    const char* color;
    const char* runs;
  } cases[] = {
      {"#ff0000", "x{#ff0000}"},
      {"red", "x{#ff0000}"},
      {" Red ", "x{#ff0000}"},
      {"#f00", "x{#ff0000}"},
      {"ff0000", "x{#ff0000}"},
      {"f00", "x{#0f0000}"},
      {"#12", "x{#010200}"},
      {"chucknorris", "x{#c00000}"},
      {"#ff00", "x{#ff0000}"},
      {"sick", "x{#00c000}"},
      {"", "x"},
      {"transparent", "x"},
      {"#", "x{#000000}"},
      {"0012300456007890", "x{#000478}"},
      {"000100020003", "x{#010203}"},
      {"ff0000000012ff0000000034ff0000000056", "x{#123456}"},
  };
  for (const auto& [color, runs] : cases) {
    const std::string html = std::string("<font color='") + color + "'>x</font>";
    EXPECT_EQ(runsText(read(html)), runs) << html;
  }
}

TEST(HtmlStyle, ShowsTheBackgroundOfElementsButNotOfThePage) {
  expectRuns(std::to_array<Case>({
      {"<span style='background-color:yellow'>x<b>y</b></span>z",
       "x{on #ffff00}|y{bold on #ffff00}|z"},
      {"<span style='background-color:red'>x<b style='background-color:transparent'>y",
       "x{on #ff0000}|y{bold on #ff0000}"},
      {"<body bgcolor=#000000>x", "x"},
      {"<body style='background-color:black;color:white'>x", "x{#ffffff}"},
      {"<table bgcolor=red><tr><td>x<td bgcolor=lime>y</table>",
       "x\t{on #ff0000}|y{on #00ff00}|\n{on #ff0000}"},
  }));
}

TEST(HtmlStyle, TakesTheBodysText) {
  expectRuns(std::to_array<Case>({
      {"<body text=#123456>x<font color=red>y</font>z</body>", "x{#123456}|y{#ff0000}|z{#123456}"},
      {"<body text=red style='font-size:20pt'><p>x", "x\n{20 #ff0000}"},
      {"<html><body text=lime><html><body>x", "x{#00ff00}"},
  }));
}

}  // namespace

}  // namespace qz
