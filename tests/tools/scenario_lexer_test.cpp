// SPDX-License-Identifier: MIT
// Words, comments and JSON in the text of scenarios.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tools/scenario/lexer.hpp"

namespace qz::tools::scenario {
namespace {

/// Returns the words of each statement, marked: bare, 'quoted', <JSON>.
std::vector<std::vector<std::string>> marked(const std::string& text) {
  std::vector<std::vector<std::string>> all;
  for (const auto& line : readWords(text)) {
    auto& words = all.emplace_back();
    for (const auto& word : line.words) {
      words.push_back(word.kind == Word::Kind::bare     ? word.text
                      : word.kind == Word::Kind::quoted ? "'" + word.text + "'"
                                                        : "<" + word.value.dump() + ">");
    }
  }
  return all;
}

TEST(ScenarioLexer, WordsStatementsAndComments) {
  const struct {
    const char* name;
    std::string text;
    std::vector<std::vector<std::string>> words;
  } cases[] = {
      {"nothing", "", {}},
      {"blank lines and comments", "\n  # only this\n\t\r\n", {}},
      {"indentation is free", "  a b\n\tc\n", {{"a", "b"}, {"c"}}},
      {"lines that end as on Windows", "a b\r\nc\r\n", {{"a", "b"}, {"c"}}},
      {"no line end at the end", "a b", {{"a", "b"}}},
      {"a byte order mark",
       "\xEF\xBB\xBF"
       "a",
       {{"a"}}},
      {"a comment behind words", "a b # c d", {{"a", "b"}}},
      {"a hash within a word", "a#b c", {{"a#b", "c"}}},
      {"a control by its tag", "a #5 #-3.text #7.x", {{"a", "#5", "#-3.text", "#7.x"}}},
      {"comments that begin like one", "a #5th\nb #5,\nc #-\nd #", {{"a"}, {"b"}, {"c"}, {"d"}}},
      {"quoted words", R"(a "b c" "" "d # e")", {{"a", "'b c'", "''", "'d # e'"}}},
      {"escapes", R"("\" \\ \/ \n \u00fc \ud83d\ude00")", {{"'\" \\ / \n ü 😀'"}}},
      {"a tab in a quoted word", "\"a\tb\"", {{"'a\tb'"}}},
      {"an escaped star keeps its backslash", R"("a \* b" "\\*")", {{"'a \\* b'", "'\\*'"}}},
      {"other letters", "grüße 価格 😀", {{"grüße", "価格", "😀"}}},
      {"JSON", R"(a {"k": [1, "x ] y"]} b)", {{"a", R"(<{"k":[1,"x ] y"]}>)", "b"}}},
      {"JSON over lines", "a {\n\"k\": [1,\n2]\n} b\nc", {{"a", R"(<{"k":[1,2]}>)", "b"}, {"c"}}},
      {"comments within JSON", "a [ # one\n1, #2\n\"#3\" ]", {{"a", R"(<[1,"#3"]>)"}}},
      {"keys keep their order", R"({"b": 1, "a": 2})", {{R"(<{"b":1,"a":2}>)"}}},
  };
  for (const auto& test : cases) EXPECT_EQ(marked(test.text), test.words) << test.name;
}

TEST(ScenarioLexer, WordsKnowWhereTheyStand) {
  const auto lines = readWords("a \"ü\" b\n [\n1] c");
  ASSERT_EQ(lines.size(), 2U);
  EXPECT_EQ(lines[0].words[1].at, (Position{1, 3}));
  EXPECT_EQ(lines[0].words[2].at, (Position{1, 7}));
  EXPECT_EQ(lines[0].end, (Position{1, 8}));
  EXPECT_EQ(lines[1].words[0].at, (Position{2, 2}));
  EXPECT_EQ(lines[1].words[1].at, (Position{3, 4}));
}

TEST(ScenarioLexer, TheSourceIsTheFirstLine) {
  const auto lines = readWords("  a b   # c\nd {\n} e");
  EXPECT_EQ(lines[0].source, "a b   # c");
  EXPECT_EQ(lines[1].source, "d { …");
}

std::string refusalOf(const std::string& text) {
  try {
    readWords(text);
  } catch (const SyntaxError& error) {
    return std::to_string(error.at().line) + ":" + std::to_string(error.at().column) + ": " +
           error.what();
  }
  return "";
}

TEST(ScenarioLexer, RefusesWhatIsNoText) {
  const struct {
    const char* name;
    std::string text;
    std::string refusal;
  } cases[] = {
      {"Latin-1", "a\nb \xFC", "2:3: a byte that is not valid UTF-8"},
      {"an overlong form", "\xC0\x80", "1:1: a byte that is not valid UTF-8"},
      {"a surrogate", "\xED\xA0\x80", "1:1: a byte that is not valid UTF-8"},
      {"beyond Unicode", "\xF4\x90\x80\x80", "1:1: a byte that is not valid UTF-8"},
      {"a cut character", "ü\xE4\xBE", "1:2: a byte that is not valid UTF-8"},
      {"a NUL", std::string("a \0", 3), "1:3: a control character"},
      {"a lone carriage return", "a\rb", "1:2: a control character"},
      {"an escape character", "a\n\x1B", "2:1: a control character"},
  };
  for (const auto& test : cases) EXPECT_EQ(refusalOf(test.text), test.refusal) << test.name;
}

TEST(ScenarioLexer, RefusesBrokenWords) {
  const struct {
    const char* name;
    std::string text;
    std::string refusal;
  } cases[] = {
      {"open quotation mark", "a \"b\nc\"", "1:3: this quotation mark is not closed on its line"},
      {"the same on Windows", "a \"b\r\nc\"", "1:3: this quotation mark is not closed on its line"},
      {"text behind a quoted word", "\"a\"b",
       "1:4: expected a blank after the closing quotation mark"},
      {"quotation mark in a word", "ab\"c",
       "1:3: a quotation mark inside a word; put a space before it"},
      {"unknown escape", "a \"b\\x\"",
       "1:5: unknown escape; expected \\\" \\\\ \\/ \\b \\f \\n \\r \\t \\uXXXX or \\*"},
      {"short \\u", "\"\\u12\"", "1:2: expected four hexadecimal digits after \\u"},
      {"half a pair", "a \"\\ud83d\"", "1:3: an unpaired surrogate in a \\u escape"},
      {"open bracket", "a [1,\n{\n", "1:3: this bracket is never closed"},
      {"open quotation mark in JSON", "[\"a\n\"]",
       "1:2: this quotation mark is not closed on its line"},
      {"text behind JSON", "[1]a", "1:4: expected a blank after the closing bracket"},
      {"a key twice", "a {\"k\": [{\"x\": 1}], \"l\": {\"x\": 1}, \"k\": 2}",
       "1:3: the key \"k\" occurs twice in one object"},
      {"a number too large", "[1e999]", "1:1: number overflow parsing '1e999'"},
  };
  for (const auto& test : cases) EXPECT_EQ(refusalOf(test.text), test.refusal) << test.name;
}

TEST(ScenarioLexer, RefusesBrokenJsonWhereItBreaks) {
  EXPECT_TRUE(refusalOf("a [1,\n  2 3]").starts_with("2:5: syntax error"))
      << refusalOf("a [1,\n  2 3]");
  EXPECT_TRUE(refusalOf("a [1}").starts_with("1:5: syntax error"));
  EXPECT_TRUE(refusalOf("# ü\na {\"ü\": nul}").starts_with("2:12: syntax error"));
}

TEST(ScenarioLexer, RefusesJsonThatNestsTooDeeply) {
  const auto nested = [](std::size_t depth) {
    return std::string(depth, '[') + std::string(depth, ']');
  };
  EXPECT_EQ(refusalOf(nested(512)), "");
  EXPECT_EQ(refusalOf(nested(513)), "1:513: JSON nested more than 512 deep");
  EXPECT_EQ(refusalOf(std::string(1000000, '[')), "1:513: JSON nested more than 512 deep");
}

}  // namespace
}  // namespace qz::tools::scenario
