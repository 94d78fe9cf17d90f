// SPDX-License-Identifier: MIT
// What counts as equal: JSON values, log lines and patterns, class names, near misses.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tools/scenario/json.hpp"
#include "tools/scenario/vocabulary.hpp"
#include "tools/scenario/wildcard.hpp"
#include "tools/support/suggestions.hpp"

namespace qz::tools::scenario {
namespace {

TEST(ScenarioComparing, JsonValues) {
  const struct {
    const char* a;
    const char* b;
    bool same;
  } cases[] = {
      {"60", "60.0", true},
      {"60", "60.5", false},
      {"-1", "-1.0", true},
      {"18446744073709551615", "-1", false},
      {"9007199254740993", "9007199254740992", false},
      {"18446744073709551615", "1.8446744073709552e19", true},
      {"1", "true", false},
      {"0", "false", false},
      {"\"1\"", "1", false},
      {"null", "null", true},
      {"null", "0", false},
      {"[1, 2]", "[1.0, 2]", true},
      {"[1, 2]", "[2, 1]", false},
      {"[1]", "[1, 1]", false},
      {R"({"a": 1, "b": [2]})", R"({"b": [2.0], "a": 1})", true},
      {R"({"a": 1})", R"({"a": 1, "b": 2})", false},
      {R"({"a": 1})", R"({"b": 1})", false},
      {"[]", "{}", false},
  };
  for (const auto& test : cases) {
    const auto a = Json::parse(test.a);
    const auto b = Json::parse(test.b);
    EXPECT_EQ(sameJson(a, b), test.same) << test.a << " " << test.b;
    EXPECT_EQ(sameJson(b, a), test.same) << test.b << " " << test.a;
  }
}

TEST(ScenarioComparing, WhereJsonDiffers) {
  const struct {
    const char* a;
    const char* b;
    const char* where;
  } cases[] = {
      {"1", "2", ""},
      {"[1]", "{}", ""},
      {"[1, 2]", "[1, 3]", "[1]"},
      {"[1, 2]", "[1]", "[1]"},
      {R"([{"a": [1, 2]}])", R"([{"a": [1, 3]}])", "[0].a[1]"},
      {R"({"a": 1, "b": 2})", R"({"a": 1})", ".b"},
      {R"({"a": 1})", R"({"b": 2, "a": 1})", ".b"},
  };
  for (const auto& test : cases) {
    EXPECT_EQ(whereDifferent(Json::parse(test.a), Json::parse(test.b)), test.where) << test.a;
  }
}

TEST(ScenarioComparing, Patterns) {
  const struct {
    const char* pattern;
    const char* text;
    bool matches;
  } cases[] = {
      {"", "", true},
      {"", "a", false},
      {"abc", "abc", true},
      {"abc", "abcd", false},
      {"*", "", true},
      {"*", "a\nb", true},
      {"a*", "a", true},
      {"a*", "ba", false},
      {"*c", "abc", true},
      {"a*c", "abbc", true},
      {"a*a", "a", false},
      {"a*b*c", "a-b-b-c", true},
      {"a*b*c", "acb", false},
      {"*ab*ab*", "abab", true},
      {"*ab*ab*", "aba", false},
      {R"(a\*b)", "a*b", true},
      {R"(a\*b)", "axb", false},
      {R"(\**)", "*anything", true},
      {R"(a\b)", R"(a\b)", true},
  };
  for (const auto& test : cases) {
    EXPECT_EQ(matchesPattern(test.pattern, test.text), test.matches)
        << test.pattern << " " << test.text;
  }
}

TEST(ScenarioComparing, NearMisses) {
  const std::vector<std::string_view> words = {"press", "push", "expect", "set", "state"};
  const struct {
    const char* word;
    const char* hint;
  } cases[] = {
      {"prss", "; did you mean \"press\"?"},
      {"perss", "; did you mean \"press\"?"},
      {"exppect", "; did you mean \"expect\"?"},
      {"sett", "; did you mean \"set\"?"},
      {"statte", "; did you mean \"state\"?"},
      {"walk", ""},
      {"", ""},
  };
  for (const auto& test : cases) EXPECT_EQ(didYouMean(test.word, words), test.hint) << test.word;
  EXPECT_EQ(didYouMean(std::string(100000, 'x'), words), "");
}

TEST(ScenarioComparing, WordsAsValues) {
  const struct {
    Word::Kind kind;
    const char* text;
    Takes takes;
    const char* shown;  // nullptr: not a value that `takes` allows
  } cases[] = {
      {Word::Kind::bare, "YES", Takes::flag, "YES"},
      {Word::Kind::bare, "false", Takes::flag, "NO"},
      {Word::Kind::quoted, "YES", Takes::flag, nullptr},
      {Word::Kind::quoted, "YES", Takes::flag | Takes::text, "\"YES\""},
      {Word::Kind::bare, "5", Takes::text, "\"5\""},
      {Word::Kind::bare, "5", Takes::number | Takes::text, "5"},
      {Word::Kind::bare, "5.5", Takes::number, "5.5"},
      {Word::Kind::bare, "5.5", Takes::whole, nullptr},
      {Word::Kind::bare, "-7", Takes::whole, "-7"},
      {Word::Kind::bare, "5x", Takes::number, nullptr},
      {Word::Kind::bare, "on", Takes::state, "1"},
      {Word::Kind::bare, "mixed", Takes::state, "-1"},
      {Word::Kind::bare, "mixed", Takes::flag | Takes::mixed, "\"mixed\""},
      {Word::Kind::bare, "absent", Takes::text | Takes::absent, "absent"},
      {Word::Kind::quoted, "absent", Takes::text | Takes::absent, "\"absent\""},
      {Word::Kind::bare, "empty", Takes::text, "\"empty\""},
  };
  for (const auto& test : cases) {
    const auto value = readValue({test.kind, test.text, {}, {}}, test.takes);
    EXPECT_EQ(value ? show(*value) : "none", test.shown ? test.shown : "none") << test.text;
  }
}

}  // namespace
}  // namespace qz::tools::scenario
