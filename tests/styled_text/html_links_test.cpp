// SPDX-License-Identifier: MIT
// The HTML reader: links.
#include <gtest/gtest.h>

#include <array>

#include "tests/styled_text/reading.hpp"

namespace qz {

namespace {

using namespace styled_text_tests;

TEST(HtmlLinks, AreUnderlinedAndBlueByDefault) {
  const auto text = read("<a href=\"http://example.com/\">x</a>");
  ASSERT_EQ(text.runs().size(), 1U);
  const auto& attributes = text.runs().front().attributes;
  EXPECT_EQ(attributes.link, "http://example.com/");
  EXPECT_EQ(attributes.foregroundColor, (toolkit::Color{0, 0, 0.933}));
  EXPECT_TRUE(attributes.underline);
}

TEST(HtmlLinks, AreNoneWhenEmptyOrWithinTheDocument) {
  expectRuns(std::to_array<Case>({
      {"<a href=\"\">x</a>", "x"},
      {"<a href>x</a>", "x"},
      {"<a href=' '>x</a>", "x"},
      {"<a href=\"#top\">x</a>", "x"},
      {"<a href=' #top'>x</a>", "x"},
      {"<a name=top>x</a>", "x"},
      {"<a href=page#top>x</a>", "x{#0000ee link=page#top underline}"},
      {"<a href=' x y '>x</a>", "x{#0000ee link=x y underline}"},
      {"<a href=one href=two>x</a>", "x{#0000ee link=one underline}"},
  }));
}

TEST(HtmlLinks, HaveTheColorThatTheBodySays) {
  expectRuns(std::to_array<Case>({
      {"<body link=#00e5ff vlink=#00e5ff><a href=u>x</a>", "x{#00e5ff link=u underline}"},
      {"<body link=#00e5ff  vlink=red><a href=u>x</a>", "x{#00e5ff link=u underline}"},
      {"<body vlink=red><a href=u>x</a>", "x{#ff0000 link=u underline}"},
      {"<body link='' vlink=red><a href=u>x</a>", "x{#ff0000 link=u underline}"},
      {"<body alink=red><a href=u>x</a>", "x{#0000ee link=u underline}"},
      {"<body link=red><body link=lime><a href=u>x</a>", "x{#ff0000 link=u underline}"},
      {"<body text=white link=red>a<a href=u>x</a>b",
       "a{#ffffff}|x{#ff0000 link=u underline}|b{#ffffff}"},
  }));
}

TEST(HtmlLinks, GiveWayToStyleWithinAndReplaceStyleAround) {
  expectRuns(std::to_array<Case>({
      {"<a href=u><font color=red>x</font>y</a>",
       "x{#ff0000 link=u underline}|y{#0000ee link=u underline}"},
      {"<font color=red><a href=u>x</a>y", "x{#0000ee link=u underline}|y{#ff0000}"},
      {"<a href=u style='color:red'><b>x</b></a>", "x{bold #ff0000 link=u underline}"},
  }));
}

TEST(HtmlLinks, DoNotNest) {
  expectRuns(std::to_array<Case>({
      {"<a href=u>x<a href=v>y</a>z", "x{#0000ee link=u underline}|y{#0000ee link=v underline}|z"},
      {"<a href=u>x<a name=v>y</a>z", "x{#0000ee link=u underline}|yz"},
      {"<a href=u>x<b>y<a href=v>z",
       "x{#0000ee link=u underline}|y{bold #0000ee link=u underline}|z{bold #0000ee link=v "
       "underline}"},
  }));
}

}  // namespace

}  // namespace qz
