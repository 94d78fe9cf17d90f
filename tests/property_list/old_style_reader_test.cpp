// SPDX-License-Identifier: MIT
// Old-style property lists and strings files, rule by rule.
#include <gtest/gtest.h>

#include <string>
#include <string_view>

#include "tests/property_list/reading.hpp"

namespace qz::toolkit {
namespace {

struct OldStyleCase {
  std::string_view text;
  std::string_view dump;
};

constexpr std::string_view empty = "{\"dict\":[]}";
constexpr std::string_view aIsB = "{\"dict\":[[\"a\",\"b\"]]}";

TEST(OldStyleReader, TakesRoots) {
  const OldStyleCase cases[] = {
      {"", refused},
      {" ", empty},
      {"\t\n\v\f\r \xE2\x80\xA8\xE2\x80\xA9", empty},
      {"// c", empty},
      {"/* c", empty},
      {"/* c */ // d\n ", empty},
      {"/", "\"/\""},
      {"/a", "\"/a\""},
      {"a//b", "\"a//b\""},
      {"a/*b", refused},  // `a/` is a key of a strings file; its entry is incomplete
      {"a /*b*/", "\"a\""},
      {"'a'", "\"a\""},
      {"{}", empty},
      {"()", "[]"},
      {"<>", "{\"data\":\"\"}"},
      {"{} x", refused},
      {"() ;", refused},
      {"<> <>", refused},
      {"{} // c", empty},
      {"() /* c", "[]"},
      {"}", refused},
      {"!", refused},
      {"=", refused},
      {"{", refused},
      {"(", refused},
      {"<", refused},
      {"\"a", refused},
      {"\xC2\xA0", refused},
      {"\xC3\xA9", refused},
      {std::string_view("\0", 1), refused},
      {"a\xFF", refused},
      {"a // \xFF", refused},
  };
  for (const auto& [text, dump] : cases) EXPECT_EQ(dumpOf(text), dump) << text;
}

TEST(OldStyleReader, TakesDictionaries) {
  const OldStyleCase cases[] = {
      {"{a=b;}", aIsB},
      {"{a=b}", refused},
      {"{a=b;;}", refused},
      {"{;}", refused},
      {"{a}", refused},
      {"{a;}", "{\"dict\":[[\"a\",\"a\"]]}"},
      {"{'a';}", "{\"dict\":[[\"a\",\"a\"]]}"},
      {"{a b;}", refused},
      {"{a=;}", refused},
      {"{=b;}", refused},
      {"{a=b;a=c;}", "{\"dict\":[[\"a\",\"c\"]]}"},
      {"{a=b;/*c*/}", aIsB},
      {"{a/**/=/**/b/**/;}", refused},  // the key is `a/`; it cannot contain * unquoted
      {"{a /**/=/**/ b /**/;}", aIsB},
      {"{a=b /* ; }", refused},
      {"{a=//x\n b;}", aIsB},
      {"{a=//x\xE2\x80\xA8 b;}", aIsB},
      {"{a=//x\f b;}", refused},
      {"{a=b;} }", refused},
      {"{a={b={};};}", "{\"dict\":[[\"a\",{\"dict\":[[\"b\",{\"dict\":[]}]]}]]}"},
      {"{a=(b,<01>);}", "{\"dict\":[[\"a\",[\"b\",{\"data\":\"01\"}]]]}"},
      {"{<01>=b;}", refused},
      {"{()=b;}", refused},
      {"{a=b;)", refused},
      {"{CF$UID=7;}", "{\"dict\":[[\"CF$UID\",\"7\"]]}"},
  };
  for (const auto& [text, dump] : cases) EXPECT_EQ(dumpOf(text), dump) << text;
}

TEST(OldStyleReader, TakesStringsFiles) {
  const OldStyleCase cases[] = {
      {"a=b;", aIsB},
      {"a;", "{\"dict\":[[\"a\",\"a\"]]}"},
      {"\"a\" = \"b\";", aIsB},
      {"// c\na = b; /* d */", aIsB},
      {"a=b; c={d=e;};", "{\"dict\":[[\"a\",\"b\"],[\"c\",{\"dict\":[[\"d\",\"e\"]]}]]}"},
      {"a=b; !", aIsB},
      {"a=b; }", aIsB},
      {"a=b; = c;", aIsB},
      {"a=b; (", aIsB},
      {"a=b; \xC3\xA9", aIsB},
      {"a=b; junk", refused},
      {"a=b; junk!", refused},
      {"a=b; \"open", refused},
      {"a=b", refused},
      {"a b", refused},
      {"a !", refused},
      {"a;;", "{\"dict\":[[\"a\",\"a\"]]}"},
  };
  for (const auto& [text, dump] : cases) EXPECT_EQ(dumpOf(text), dump) << text;
}

TEST(OldStyleReader, TakesArrays) {
  const OldStyleCase cases[] = {
      {"( )", "[]"},       {"(a)", "[\"a\"]"},
      {"(a,)", "[\"a\"]"}, {"(a , 'b' /* c */ , )", "[\"a\",\"b\"]"},
      {"(,)", refused},    {"(a,,)", refused},
      {"(a b)", refused},  {"(a;)", refused},
      {"(a", refused},     {"(a,", refused},
      {"(a}", refused},    {"(({a=b;}),())", "[[{\"dict\":[[\"a\",\"b\"]]}],[]]"},
  };
  for (const auto& [text, dump] : cases) EXPECT_EQ(dumpOf(text), dump) << text;
}

TEST(OldStyleReader, TakesStrings) {
  const OldStyleCase cases[] = {
      {"azAZ09_$/:.-", "\"azAZ09_$/:.-\""},
      {"a+b", refused},
      {"a~", refused},
      {"\"it's\"", "\"it's\""},
      {"'say \"hi\"'", "\"say \\\"hi\\\"\""},
      {"\"a\nb\"", "\"a\\u000ab\""},
      {"\"a//b/*c\"", "\"a//b/*c\""},
      {"\"\xC3\xA9\xF0\x9F\x98\x80\"", "\"\\u00e9\\ud83d\\ude00\""},
      {"\"\xEF\xBB\xBF\"", "\"\\ufeff\""},
      {R"("\a\b\f\n\r\t\v")", "\"\\u0007\\u0008\\u000c\\u000a\\u000d\\u0009\\u000b\""},
      {R"("\"\'\\\x\q\8")", "\"\\\"'\\\\xq8\""},
      {"\"\\\n\"", "\"\\u000a\""},
      {"\"\\\xC3\xA9\"", "\"\\u00e9\""},
      {R"("\1\12\123\1234")", "\"\\u0001\\u000aSS4\""},
      {R"("\18\79")", "\"\\u00018\\u00079\""},
      {R"("\200\201\256\376\377\400\477")", "\"\\u00a0\\u00c0\\ufb01\\u0000\\u0000\\u0000?\""},
      {R"("\U41\U0041\U00411\U")", "\"AAA1\\u0000\""},
      {R"("\Ug\u0041")", "\"\\u0000gu0041\""},
      {R"("\Ud83d\Ude00")", "\"\\ud83d\\ude00\""},
      {R"("\Ud83d")", "\"\\ud83d\""},
      {R"("\Ude00\Ud83d")", "\"\\ude00\\ud83d\""},
      {R"("\Ud83d \Ude00")", "\"\\ud83d \\ude00\""},
      {R"("\")", refused},
      {R"("\U00)", refused},
      {R"("a')", refused},
  };
  for (const auto& [text, dump] : cases) EXPECT_EQ(dumpOf(text), dump) << text;
}

TEST(OldStyleReader, JoinsHalvesOfCharacters) {
  // A key written as one character and the same key written as its two halves are equal.
  EXPECT_EQ(dumpOf("{\"\xF0\x9F\x98\x80\" = a; \"\\Ud83d\\Ude00\" = b;}"),
            "{\"dict\":[[\"\\ud83d\\ude00\",\"b\"]]}");
}

TEST(OldStyleReader, TakesData) {
  const OldStyleCase cases[] = {
      {"<0aFf>", "{\"data\":\"0aff\"}"},
      {"< 01 02\t03\r\n04 >", "{\"data\":\"01020304\"}"},
      {"<0 1>", refused},
      {"<012>", refused},
      {"<0g>", refused},
      {"<01,02>", refused},
      {"<01\v02>", refused},
      {"<01//c\n>", refused},
      {"<01", refused},
      {"<01 ", refused},
      {"<*I5>", refused},
      {"<*BY>", refused},
      {"<[AQID]>", refused},
  };
  for (const auto& [text, dump] : cases) EXPECT_EQ(dumpOf(text), dump) << text;
}

TEST(OldStyleReader, TakesDeepNestingUpToALimit) {
  const auto arrays = [](std::size_t depth, std::string_view leaf) {
    return repeated("(", depth) + std::string(leaf) + repeated(")", depth);
  };
  const auto dictionaries = [](std::size_t depth, std::string_view leaf) {
    return repeated("{k=", depth) + std::string(leaf) + repeated(";}", depth);
  };
  EXPECT_NE(dumpOf(arrays(513, "")), refused);
  EXPECT_EQ(dumpOf(arrays(514, "")), refused);
  EXPECT_NE(dumpOf(arrays(512, "x")), refused);
  EXPECT_NE(dumpOf(dictionaries(512, "x")), refused);
  EXPECT_EQ(dumpOf(dictionaries(513, "x")), refused);
  EXPECT_EQ(dumpOf(repeated("(", 1'000'000)), refused);
  EXPECT_EQ(dumpOf(repeated("{a=", 1'000'000)), refused);
}

}  // namespace
}  // namespace qz::toolkit
