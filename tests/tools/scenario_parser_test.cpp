// SPDX-License-Identifier: MIT
// Parsing scenario files: their scenarios, and which texts are refused.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "scenario_support.hpp"
#include "tools/scenario/parser.hpp"
#include "tools/support/suggestions.hpp"

namespace qz::tools::scenario {
namespace {

ScenarioFile parsed(const std::string& text) { return parseScenarios(text, vocabulary()); }

// The names as messages list them.
std::string listed(const std::vector<std::string_view>& names) {
  return enumerate({names.begin(), names.end()});
}

std::vector<std::string> sources(const std::vector<Statement>& statements) {
  std::vector<std::string> all;
  all.reserve(statements.size());
  for (const auto& statement : statements) all.push_back(statement.source);
  return all;
}

TEST(ScenarioParser, AFileWithoutSectionsIsOneScenario) {
  const auto file = parsed("# intro\n\nengine\nexpect alive\n");
  ASSERT_EQ(file.scenarios.size(), 1U);
  EXPECT_EQ(file.scenarios[0].title, "");
  EXPECT_EQ(file.scenarios[0].line, 3);
  EXPECT_EQ(sources(file.scenarios[0].statements),
            (std::vector<std::string>{"engine", "expect alive"}));
  EXPECT_TRUE(file.common.empty());
}

TEST(ScenarioParser, SectionsShareTheCommonBeginning) {
  const auto file =
      parsed("engine\nscenario \"a title\"\nrestore\nscenario two words\nterminate\n");
  EXPECT_EQ(sources(file.common), std::vector<std::string>{"engine"});
  ASSERT_EQ(file.scenarios.size(), 2U);
  EXPECT_EQ(file.scenarios[0].title, "a title");
  EXPECT_EQ(file.scenarios[0].line, 2);
  EXPECT_EQ(file.scenarios[1].title, "two words");
  EXPECT_EQ(sources(file.scenarios[1].statements), std::vector<std::string>{"terminate"});
}

TEST(ScenarioParser, NamesOfTheCommonBeginningAreKnownInEverySection) {
  EXPECT_EQ(refusal("window w\nscenario a\ncontrol c NSButton 1 in w\nscenario b\nadopt w\n"), "");
  EXPECT_EQ(refusal("window w\nscenario a\ncontrol c NSButton 1 in w\nscenario b\npress c\n"),
            "5:7: \"c\" is not declared");
}

TEST(ScenarioParser, OnlyHoldsForTheFileOrForOneScenario) {
  const auto file = parsed("only qt appkit\nscenario a\nengine\nscenario b\nonly memory\nengine\n");
  EXPECT_EQ(file.scenarios[0].only, (std::vector<std::string>{"qt", "appkit"}));
  EXPECT_EQ(file.scenarios[1].only, (std::vector<std::string>{"memory"}));
}

TEST(ScenarioParser, TheResultBelongsToTheInnermostStatement) {
  const auto file = parsed("engine\nwhen sheet ends repeat 2 find 5 => none\n");
  const auto& when = file.scenarios[0].statements[1];
  EXPECT_FALSE(when.clause);
  const auto& repeat = *when.arguments.nested();
  const auto& find = *repeat.arguments.nested();
  EXPECT_FALSE(repeat.clause);
  ASSERT_TRUE(find.clause);
  EXPECT_EQ(find.clause->result.text, "none");
  EXPECT_EQ(find.at, (Position{2, 26}));
}

TEST(ScenarioParser, RefusesUnknownWords) {
  const struct {
    const char* text;
    std::string refusal;
  } cases[] = {
      {"engine\n  prss next", "2:3: unknown statement \"prss\"; did you mean \"press\"?"},
      {"scenaro x", "1:1: unknown statement \"scenaro\"; did you mean \"scenario\"?"},
      {"\"engine\"", "1:1: expected a statement, which begins with a bare word"},
      {"[1] x", "1:1: expected a statement, which begins with a bare word"},
      {"control a NSButon 1 in w",
       "1:11: unknown class \"NSButon\"; did you mean \"NSButton\"?; the classes are " +
           listed(drivers::viewKindNames())},
      {"only memry",
       "1:6: found \"memry\", expected " + listed(toolkitNames()) + " (only TOOLKIT...)"},
      {"set constant HIDE_OBJECT x",
       "1:14: unknown command name \"HIDE_OBJECT\"; did you mean "
       "\"QZ_PLIST_STATE_PARSER_HIDE_OBJECT_WITH_ID\"?"},
      {"expect aliv",
       "1:8: found \"aliv\", expected state, log, no, same, alive, destroyed, delegate.ends, "
       "entries "
       "or NAME.PROPERTY; did you mean \"alive\"?"},
      {"expect engine.flshing YES",
       "1:8: the engine has no property \"flshing\"; did you mean \"flashing\"?"},
      {"window w\nexpect w.visble YES",
       "2:8: a window has no property \"visble\"; did you mean \"visible\"?"},
      {"expect #5.titel x", "1:8: a control has no property \"titel\"; did you mean \"title\"?"},
      {"window panel\nexpect pannel.visible YES",
       "2:8: \"pannel\" is not declared; did you mean \"panel\"?"},
  };
  for (const auto& test : cases) EXPECT_EQ(refusal(test.text), test.refusal) << test.text;
}

TEST(ScenarioParser, RefusesWrongArguments) {
  const struct {
    const char* text;
    const char* refusal;
  } cases[] = {
      {"press",
       "1:6: found the end of the line, expected a control (a declared name, #TAG or @INDEX) "
       "(press C)"},
      {"advance soon",
       "1:9: found \"soon\", expected a number of seconds, 0 or more (advance SECONDS)"},
      {"advance -1",
       "1:9: found \"-1\", expected a number of seconds, 0 or more (advance SECONDS)"},
      {"restore now", "1:9: found \"now\", expected the end of the line (restore)"},
      {"window w 1 2",
       "1:13: found the end of the line, expected a number (window +W [X Y WIDTH HEIGHT])"},
      {"window w\nadopt [1]",
       "2:7: found JSON, expected none or a window (a declared name or tutorial) (adopt none|W)"},
      {"find 1.5", "1:6: found \"1.5\", expected a whole number (find TAG)"},
      {"find 9223372036854775808",
       "1:6: found \"9223372036854775808\", expected a whole number (find TAG)"},
      {"timer -1 5",
       "1:7: found \"-1\", expected a whole number, 0 or more (timer UNSIGNED none|KEY)"},
      {"repeat 0 restore",
       "1:8: found \"0\", expected a whole number from 1 to 1000000 (repeat COUNT STATEMENT...)"},
      {"repeat 2",
       "1:9: found the end of the line, expected a statement (repeat COUNT STATEMENT...)"},
      {"load x fron 1",
       "1:8: found \"fron\", expected the end of the line (load none|TEXT [from KEY] [as sheet])"},
      {"load x as shet",
       "1:11: found \"shet\", expected sheet; did you mean \"sheet\"? (load none|TEXT [from KEY] "
       "[as "
       "sheet])"},
      {"assets [1]",
       "1:8: found JSON, expected none, entries or a JSON object (assets none|entries|OBJECT)"},
      {"run [null] for 1", "1:5: null is not allowed in a property-list value"},
      {"engine\nscenario", "2:9: found the end of the line, expected a text (scenario TEXT...)"},
      {"repeat 2 scenario x", "1:10: \"scenario\" cannot be used inside another statement"},
  };
  for (const auto& test : cases) EXPECT_EQ(refusal(test.text), test.refusal) << test.text;
}

TEST(ScenarioParser, RefusesWrongNames) {
  const struct {
    const char* text;
    const char* refusal;
  } cases[] = {
      {"window w\nwindow w", "2:8: \"w\" is already a window, since line 1"},
      {"window w\ncontrol w NSButton 1 in w", "2:9: \"w\" is already a window, since line 1"},
      {"window tutorial", "1:8: \"tutorial\" is reserved; use another name"},
      {"window a.b",
       "1:8: \"a.b\" is not a name; names consist of letters, digits, _ and -, and begin with a "
       "letter "
       "or _"},
      {"window 5",
       "1:8: \"5\" is not a name; names consist of letters, digits, _ and -, and begin with a "
       "letter "
       "or _"},
      {"window w\npress w", "2:7: \"w\" is a window, expected a control"},
      {"adopt #5", "1:7: \"#5\" is a control, expected a window"},
      {"window w\nengine\nset engine.window v", "3:19: \"v\" is not declared"},
      {"fire t", "1:6: \"t\" is not declared"},
      {"keep t engine.guiAssets\nset t absent",
       "2:5: found \"t\", expected constant or NAME.PROPERTY"},
      {"window w\nset w.visible NO", "2:5: \"w.visible\" cannot be set"},
      {"set #1.bold YES",
       "1:5: \"#1.bold\" cannot be set; these can be set: tag, frame, hidden, enabled, state, "
       "highlighted, "
       "title, text, tooltip, image, action, target or background"},
      {"expect engine.flashing.x YES", "1:8: \"engine.flashing\" has no keys"},
  };
  for (const auto& test : cases) EXPECT_EQ(refusal(test.text), test.refusal) << test.text;
}

TEST(ScenarioParser, RefusesWrongValues) {
  const struct {
    const char* text;
    const char* refusal;
  } cases[] = {
      {"expect #1.hidden maybe", "1:18: found \"maybe\", expected YES or NO"},
      {"expect #1.tag 1.5", "1:15: found \"1.5\", expected a whole number"},
      {"expect #1.state ON", "1:17: found \"ON\", expected a whole number or on, off or mixed"},
      {"expect #1.text [1]", "1:16: found JSON, expected a text, absent, present or empty"},
      {"expect #1.bold \"YES\"", "1:16: found \"YES\", expected YES or NO or mixed"},
      {"expect engine.guiAssets 5",
       "1:25: found \"5\", expected a JSON object, absent, present or empty"},
      {"set engine.guiAssets {}", "1:22: found JSON, expected absent or empty"},
      {"set engine.commandArray [null]", "1:25: null is not allowed in a property-list value"},
      {"set #1.hidden absent", "1:15: found \"absent\", expected YES or NO"},
  };
  for (const auto& test : cases) EXPECT_EQ(refusal(test.text), test.refusal) << test.text;
}

TEST(ScenarioParser, RefusesWrongResults) {
  const struct {
    const char* text;
    const char* refusal;
  } cases[] = {
      {"adopt none =>", "1:14: found the end of the line, expected YES, NO or raises"},
      {"adopt none => 1", "1:15: found \"1\", expected YES, NO or raises"},
      {"adopt none => NO YES", "1:18: found \"YES\", expected the end of the line"},
      {"restore => YES", "1:12: found \"YES\", expected raises"},
      {"find 1 => YES", "1:11: \"YES\" is not declared"},
      {"expect alive => YES", "1:14: this statement has no result"},
      {"=> YES", "1:1: expected a statement before =>"},
      {"repeat 2 => YES",
       "1:10: found the end of the line, expected a statement (repeat COUNT "
       "STATEMENT...)"},
  };
  for (const auto& test : cases) EXPECT_EQ(refusal(test.text), test.refusal) << test.text;
}

TEST(ScenarioParser, RefusesNamesOfFilesOutsideOfTheResourceDirectory) {
  for (const std::string name :
       {"/etc/passwd", "../x", "a/../../x", "a/..", "$RESOURCES/x", "a//b", "./x", "a\\b"}) {
    EXPECT_EQ(refusal("file " + inQuotes(name) + " text"),
              "1:6: " + inQuotes(name) + " does not name a file in the resource directory");
  }
  EXPECT_EQ(refusal("file a/..b/c.txt text"), "");
  EXPECT_EQ(
      refusal("copy a /etc/passwd"),
      "1:8: found \"/etc/passwd\", expected a path relative to the scenario's folder (copy FILE "
      "PATH)");
}

TEST(ScenarioParser, RefusesScenariosThatTryNothing) {
  EXPECT_EQ(refusal(""), "1:1: a scenario without a statement");
  EXPECT_EQ(refusal("\n only memory\n"), "2:2: a scenario without a statement");
  EXPECT_EQ(refusal("engine\nscenario a\nscenario b\nengine"),
            "2:1: a scenario without a statement");
  EXPECT_EQ(refusal("engine\nscenario a\nengine\n scenario b"),
            "4:2: a scenario without a statement");
}

TEST(ScenarioParser, RefusesEndlessNesting) {
  std::string text;
  for (int i = 0; i < 21; ++i) text += "repeat 2 ";
  EXPECT_EQ(refusal(text + "restore"), "1:190: statements nested too deeply");
}

}  // namespace
}  // namespace qz::tools::scenario
