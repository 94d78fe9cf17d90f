// SPDX-License-Identifier: MIT
// XML property lists, rule by rule: which are accepted, and their values.
#include <gtest/gtest.h>

#include <string>
#include <string_view>

#include "tests/property_list/reading.hpp"

namespace qz::toolkit {
namespace {

struct XmlCase {
  std::string xml;
  std::string_view dump;
};

TEST(XmlReader, TakesWhatStandsAroundTheRoot) {
  const XmlCase cases[] = {
      {"<string>a</string>", "\"a\""},
      {" \t\r\n<string>a</string>", "\"a\""},
      {"\f<string>a</string>", refused},
      {"\xC2\xA0<string>a</string>", refused},
      {"<?xml version=\"1.0\"?><?x?><!DOCTYPE plist><!-- c --><plist><true/></plist>", "true"},
      {"<!DOCTYPEplist><plist><true/></plist>", "true"},
      {"<!DOCTYPE x SYSTEM \"<>\"><plist><true/></plist>", refused},
      {"<!doctype plist><plist><true/></plist>", refused},
      {"<!DOCTYPE plist [<!ENTITY a \"b\">]><plist><true/></plist>", refused},
      {"<!ELEMENT plist ANY><plist><true/></plist>", refused},
      {"<!-- a > b -- c --><true/>", "true"},
      {"<!----->"
       "<true/>",
       "true"},
      {"<!----><true/>", refused},
      {"<!-- open <true/>", refused},
      {"<?x <true/>", refused},
      {"<?><true/>", refused},
      {"<?><true/>?><false/>", "false"},
      {"<true/>anything", "true"},
      {"<true/><false/>", "true"},
      {"<plist><true/></plist>anything", "true"},
      {"<plist><true/></plist", refused},
      {"<plist><true/>", refused},
      {"<plist><true/><false/></plist>", refused},
      {"<plist></plist>", refused},
      {"<plist/>", refused},
      {"<plist><!-- c --><true/><!-- c --></plist>", "true"},
      {"<plist version=\"9.9\" other><true/></plist >", "true"},
      {"<PLIST><true/></PLIST>", refused},
      {"", refused},
      {"<", refused},
      {"<true", refused},
      {"</true>", refused},
  };
  for (const auto& [xml, dump] : cases) EXPECT_EQ(dumpOf(xml), dump) << xml;
}

TEST(XmlReader, TakesTagsAsThePlatformDoes) {
  const XmlCase cases[] = {
      {"<string>a</string >", "\"a\""},
      {"<string>a</string\n>", "\"a\""},
      {"<string>a</ string>", refused},
      {"<string>a</strings>", refused},
      {"<string>a</STRING>", refused},
      {"<string>a</array>", refused},
      {"<string   >a</string>", "\"a\""},
      {"<string x='1'\ty=\"2\">a</string>", "\"a\""},
      {"<string a=\">\">b</string>", "\"\\\">b\""},
      {"<dict/ >", refused},
      {"<dict / >", refused},
      {"<dict a='b' />", "{\"dict\":[]}"},
      {"<dict a=/>", "{\"dict\":[]}"},
      {"<Dict/>", refused},
      {"<strings/>", refused},
      {"<>", refused},
      {"</>", refused},
      {"<array/>", "[]"},
      {"<string/>", "\"\""},
      {"<key/>", "\"\""},
      {"<true/>", "true"},
      {"<false/>", "false"},
      {"<false></false>", "false"},
      {"<false> </false>", refused},
      {"<true>1</true>", refused},
      {"<data/>", refused},
      {"<date/>", refused},
      {"<integer/>", refused},
      {"<real/>", refused},
      {"<null/>", refused},
  };
  for (const auto& [xml, dump] : cases) EXPECT_EQ(dumpOf(plist(xml)), dump) << xml;
}

TEST(XmlReader, TakesArraysAndDictionaries) {
  const XmlCase cases[] = {
      {"<array></array>", "[]"},
      {"<array> <?p?> <!----> <true/>\n<string>a</string></array>", "[true,\"a\"]"},
      {"<array><?><true/><?></array>", "[true]"},
      {"<array><?><true/><?p?></array>", "[true]"},
      {"<array><? <true/></array>", refused},
      {"<dict><?><key>a</key><?><true/></dict>", "{\"dict\":[[\"a\",true]]}"},
      {"<array><key>k</key></array>", "[\"k\"]"},
      {"<array><plist><true/></plist></array>", "[true]"},
      {"<array><plist></plist></array>", refused},
      {"<array><plist/></array>", refused},
      {"<array>&#32;</array>", refused},
      {"<array>x</array>", refused},
      {"<array><![CDATA[ ]]></array>", refused},
      {"<array><!x></array>", refused},
      {"<array><!- -></array>", refused},
      {"<array><!-- --></array", refused},
      {"<array><true/></dict>", refused},
      {"<array>", refused},
      {"<dict></dict>", "{\"dict\":[]}"},
      {"<dict><key>a</key><true/><key>b</key><false/></dict>",
       "{\"dict\":[[\"a\",true],[\"b\",false]]}"},
      {"<dict><key>a</key><true/><key>a</key><false/></dict>", "{\"dict\":[[\"a\",false]]}"},
      {"<dict><key>a</key><key>b</key></dict>", "{\"dict\":[[\"a\",\"b\"]]}"},
      {"<dict><string>a</string><true/></dict>", refused},
      {"<dict><true/><true/></dict>", refused},
      {"<dict><plist><key>a</key></plist><true/></dict>", refused},
      {"<dict><key>a</key></dict>", refused},
      {"<dict><key>a</key>x<true/></dict>", refused},
      {"<dict><key>&amp;<![CDATA[<]]></key><true/></dict>", "{\"dict\":[[\"&<\",true]]}"},
  };
  for (const auto& [xml, dump] : cases) EXPECT_EQ(dumpOf(plist(xml)), dump) << xml;
}

TEST(XmlReader, TakesUids) {
  const std::string uid = "<key>CF$UID</key><integer>7</integer>";
  const XmlCase cases[] = {
      {"<array><dict>" + uid + "</dict></array>", "[{\"uid\":7}]"},
      {"<dict>" + uid + uid + "</dict>", "{\"uid\":7}"},
      {"<dict><key>CF$UID</key><integer>4294967295</integer></dict>", "{\"uid\":4294967295}"},
      {"<dict><key>CF$UID</key><integer>4294967298</integer></dict>", "{\"uid\":2}"},
      {"<dict><key>CF$UID</key><true/></dict>", "{\"dict\":[[\"CF$UID\",true]]}"},
      {"<dict><key>CF$UID</key><integer>-1</integer></dict>", "{\"uid\":4294967295}"},
      {"<dict>" + uid + "<key>a</key><true/></dict>",
       "{\"dict\":[[\"CF$UID\",{\"int\":\"7\"}],[\"a\",true]]}"},
  };
  for (const auto& [xml, dump] : cases) EXPECT_EQ(dumpOf(plist(xml)), dump) << xml;
  EXPECT_FALSE(dictionaryFromPropertyList(plist("<dict>" + uid + "</dict>")));
}

TEST(XmlReader, TakesRealUidsAsSignedIntegersOf32Bits) {
  const struct {
    std::string_view real;
    std::string_view number;
  } cases[] = {
      {"1", "1"},
      {"3.14", "3"},
      {"-3.14", "4294967293"},
      {"-0.9", "0"},
      {"2147483647.9", "2147483647"},
      {"-2147483648.9", "2147483648"},
      // Numbers that do not fit.
      {"2147483648", "2147483648"},
      {"4294967297", "2147483648"},
      {"-2147483649", "2147483648"},
      {"nan", "2147483648"},
      {"inf", "2147483648"},
      {"-inf", "2147483648"},
  };
  for (const auto& [real, number] : cases) {
    const std::string uid = "<dict><key>CF$UID</key><real>" + std::string(real) + "</real></dict>";
    EXPECT_EQ(dumpOf(plist("<array>" + uid + "</array>")),
              "[{\"uid\":" + std::string(number) + "}]")
        << real;
    EXPECT_FALSE(dictionaryFromPropertyList(plist(uid))) << real;
  }
}

TEST(XmlReader, TakesStrings) {
  const XmlCase cases[] = {
      {"&lt;&gt;&amp;&apos;&quot;", "\"<>&'\\\"\""},
      {"&LT;", refused},
      {"&nbsp;", refused},
      {"&lt", refused},
      {"& ", refused},
      {"&", refused},
      {"&;", refused},
      {"&#65;&#x42;&#x6a;&#x6A;", "\"ABjj\""},
      {"&#X42;", refused},
      {"&#00000065;", "\"A\""},
      {"&#000000065;", refused},
      {"&#x00000041;", "\"A\""},
      {"&#x000000041;", refused},
      {"&#;&#x;&#0;", "\"\\u0000\\u0000\\u0000\""},
      {"&#xD7FF;&#xE000;&#x10FFFF;", "\"\\ud7ff\\ue000\\udbff\\udfff\""},
      {"&#xD800;", refused},
      {"&#xDFFF;", refused},
      {"&#x110000;", refused},
      {"&#99999999;", refused},
      {"&#xFFFFFFFF;", refused},
      {"&#12a;", refused},
      {"&#x1g;", refused},
      {"&#+1;", refused},
      {"&#65 ;", refused},
      {"a<![CDATA[]]>b<![CDATA[&amp;]]]]>", "\"ab&amp;]]\""},
      {"<![CDATA[a]]", refused},
      {"<![cdata[a]]>", refused},
      {"a<!-- c -->", refused},
      {"a<?p?>", refused},
      {"a<b/>", refused},
      {"]]>", "\"]]>\""},
      {" \t\r\n", "\" \\u0009\\u000d\\u000a\""},
      {std::string("a\0b", 3), "\"a\\u0000b\""},
  };
  for (const auto& [text, dump] : cases) {
    EXPECT_EQ(dumpOf(plist("<string>" + text + "</string>")), dump) << text;
    EXPECT_EQ(dumpOf(plist("<key>" + text + "</key>")), dump) << text;
  }
}

TEST(XmlReader, TakesUtf8AndNothingElseInStrings) {
  const XmlCase cases[] = {
      {"\xC3\xA9\xE2\x98\xBA\xF0\x9F\x98\x80", "\"\\u00e9\\u263a\\ud83d\\ude00\""},
      {"\xEF\xBB\xBF"
       "a\xEF\xBB\xBF",
       "\"a\\ufeff\""},
      {"\xEF\xBB\xBF", "\"\""},
      {"\xEF\xBB\xBF\xEF\xBB\xBF", "\"\\ufeff\""},
      {"&#xFEFF;a", "\"a\""},
      {"<![CDATA[\xEF\xBB\xBF]]>a", "\"a\""},
      {"\xC3<![CDATA[\xA9]]>", "\"\\u00e9\""},  // checked after the parts are joined
      {"\x80", refused},
      {"a\xC3", refused},
      {"a\xC3&amp;", refused},
      {"\xC0\x80", refused},
      {"\xC1\xBF", refused},
      {"\xE0\x9F\xBF", refused},
      {"\xE0\xA0\x80", "\"\\u0800\""},
      {"\xED\x9F\xBF", "\"\\ud7ff\""},
      {"\xED\xA0\x80", refused},
      {"\xF0\x8F\xBF\xBF", refused},
      {"\xF0\x90\x80\x80", "\"\\ud800\\udc00\""},
      {"\xF4\x8F\xBF\xBF", "\"\\udbff\\udfff\""},
      {"\xF4\x90\x80\x80", refused},
      {"\xF5\x80\x80\x80", refused},
      {"\xEF\xBF\xBF", "\"\\uffff\""},
      {"12345678\xFF", refused},
      {"1234567890123456\xC3\xA9", "\"1234567890123456\\u00e9\""},
  };
  for (const auto& [text, dump] : cases) {
    EXPECT_EQ(dumpOf(plist("<string>" + text + "</string>")), dump) << text;
  }
  EXPECT_EQ(dumpOf("<!-- \xFF --><plist><!-- \xC3 --><true a='\xFF'></true></plist>"), "true");
}

TEST(XmlReader, TakesDeepNestingUpToALimit) {
  const auto arrays = [](std::size_t depth, std::string_view leaf) {
    return plist(repeated("<array>", depth) + std::string(leaf) + repeated("</array>", depth));
  };
  const auto dictionaries = [](std::size_t depth) {
    return plist(repeated("<dict><key>k</key>", depth) + "<true/>" + repeated("</dict>", depth));
  };
  EXPECT_NE(dumpOf(arrays(512, "")), refused);
  EXPECT_EQ(dumpOf(arrays(513, "")), refused);
  EXPECT_NE(dumpOf(arrays(512, "<string>leaf</string>")), refused);
  EXPECT_NE(dumpOf(arrays(512, "<array/>")), refused);
  EXPECT_NE(dumpOf(arrays(512, "<dict/>")), refused);
  EXPECT_EQ(dumpOf(arrays(512, "<dict></dict>")), refused);
  EXPECT_NE(dumpOf(dictionaries(512)), refused);
  EXPECT_EQ(dumpOf(dictionaries(513)), refused);
  EXPECT_EQ(dumpOf(repeated("<plist>", 514) + "<true/>" + repeated("</plist>", 514)), refused);
}

}  // namespace
}  // namespace qz::toolkit
