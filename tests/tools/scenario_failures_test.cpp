// SPDX-License-Identifier: MIT
// Scenarios that must fail: the line and the message of the failure.
#include <gtest/gtest.h>

#include <string>

#include "scenario_support.hpp"

namespace qz::tools::scenario {
namespace {

/// A window with a button and a label, and an engine that has adopted it. Six lines.
const std::string beginning =
    "window panel\n"
    "control next NSButton 2 in panel\n"
    "control label NSTextField 5 in panel\n"
    "engine\n"
    "adopt panel => YES\n"
    "ignore log\n";

struct Case {
  const char* text;     ///< appended to `beginning`
  const char* failure;  ///< "LINE: problem"; counts lines from the first of `beginning`
};

void expectFailures(std::initializer_list<Case> cases) {
  for (const auto& test : cases) {
    EXPECT_EQ(failure(beginning + test.text), test.failure) << test.text;
  }
}

TEST(ScenarioFailures, ExpectationsThatDoNotHold) {
  expectFailures({
      {"expect label.text \"Well done\"", "7: expected \"Well done\", got \"\""},
      {"expect next.hidden YES", "7: expected YES, got NO"},
      {"expect next.tag 3", "7: expected 3, got 2"},
      {"expect engine.commandArray present", "7: expected present, got absent"},
      {"expect engine.plistDictionary absent", "7: expected absent, got {}"},
      {"expect engine.guiAssets empty",
       "7: expected empty, got "
       "{\"2\":[\"NSButton\",[20.0,20.0,100.0,30.0],2],\"5\":[\"NSTextField\","
       "[140.0,20.0,100.0,30.0],5]}"},
      {"expect engine.originalTagValues {\"5\": 5, \"2\": 3}",
       "7: expected {\"5\":5,\"2\":3}, got {\"2\":2,\"5\":5} (they differ at .2)"},
      {"expect engine.originalTagValues.2 3", "7: expected 3, got 2"},
      {"expect engine.originalTagValues.3 present", "7: expected present, got absent"},
      {"expect panel.subviews [\"NSButton\"]",
       "7: expected [\"NSButton\"], got [\"NSButton\",\"NSTextField\"] (they differ at [1])"},
      {"expect engine.tutorialWindow tutorial", "7: expected \"tutorial\", got \"panel\""},
      {"expect state 5", "7: expected \"5\", got \"0\""},
      {"expect same next label", "7: expected one control, got next and label"},
      {"expect no #5", "7: expected no control #5, got label"},
      {"expect destroyed", "7: expected the engine destroyed, got a living engine"},
      {"release\nset label.text x\nexpect alive\nadopt panel",
       "10: expected an engine that the host holds, got none"},
      {"expect delegate.ends [0]", "7: expected [0], got [] (they differ at [0])"},
      {"expect entries {\"1\": []}", "7: expected {\"1\":[]}, got {} (they differ at .1)"},
      {"keep tags engine.originalTagValues\nexpect tags.2 7", "8: expected 7, got 2"},
  });
}

TEST(ScenarioFailures, Results) {
  expectFailures({
      {"adopt none => YES", "7: expected YES, got NO"},
      {"find 2 => label", "7: expected label, got next"},
      {"find 9 => label", "7: expected label, got none"},
      {"find 2 => none", "7: expected none, got next"},
      {"restore => raises", "7: expected an exception, got ok"},
      {"adopt none => raises", "7: expected an exception, got NO"},
      {"compound FLASH_ID [] for 1",
       "7: expected no exception, got NSRangeException: -[NSArray objectAtIndex:]: index 1 beyond "
       "bounds for empty array"},
      {"repeat 3 adopt none => YES", "7: expected YES, got NO"},
  });
}

TEST(ScenarioFailures, LogLines) {
  expectFailures({
      {"expect log \"a\"", "7: expected the log line \"a\", got no further line"},
      {"press next\nexpect log \"Button\"",
       "8: expected the log line \"Button\", got \"Button tag 2 pressed.\""},
      {"press next\nexpect no log", "8: expected no log line, got \"Button tag 2 pressed.\""},
      {"press next",
       "7: expected no further log line, got \"Button tag 2 pressed.\" logged in line 7"},
      {"press next\npress next\nexpect state 0\nexpect state 0",
       "10: expected no further log line, got \"Button tag 2 pressed.\" logged in line 7 (and 1 "
       "more)"},
      {"press next\nexpect log \"*\"\nexpect log \"*\"",
       "9: expected the log line \"*\", got no further line"},
  });
}

TEST(ScenarioFailures, ThingsThatAreNotThere) {
  expectFailures({
      {"press #9", "7: expected the control #9, got none"},
      {"press @2", "7: expected the control @2, got none"},
      {"destroy next\nexpect next.tag 2", "8: expected the control next, got none"},
      {"destroy panel\nexpect panel.visible NO", "8: expected the window panel, got none"},
      {"destroy panel\nexpect label.text x", "8: expected the control label, got none"},
      {"engine\nexpect tutorial.visible NO", "8: expected the window tutorial, got none"},
      {"when sheet ends window late\nadopt late", "8: expected the window late, got none"},
      {"keep t timer 7", "7: expected an object timer under \"7\", got none"},
      {"keep t engine.guiAssets\nfire t", "8: expected a kept timer, got t, which is not a timer"},
      {"target label", "7: expected a button, got label, which is not a button"},
      {"set label.state on", "7: expected a button, got NSTextField"},
      {"set next.state 2", "7: expected -1, 0 or 1, got 2"},
      {"set next.frame [1, 2, 3]", "7: expected [x, y, width, height], got [1,2,3]"},
      {"set next.background red", "7: expected \"#rrggbb\", got \"red\""},
      {"set next.target me", "7: expected engine, host or absent, got \"me\""},
      {"terminate\nignore log\nrelease\nexpect engine.flashing NO",
       "10: expected an engine, got a destroyed engine"},
  });
  EXPECT_EQ(failure("window w\nexpect #5.tag 5"), "2: expected an engine, got none");
}

TEST(ScenarioFailures, WhatTheHostWasToDo) {
  expectFailures({
      {"when sheet ends release", "7: expected the end of a sheet, got none"},
      {"when action next release\npress next\nignore log",
       "7: expected the host's action from next, got none"},
      {"when log \"x*\" release\npress next\nignore log",
       "7: expected a log line \"x*\", got none"},
      {"when log \"Button*\" expect next.hidden YES\npress next\nignore log",
       "7: expected YES, got NO"},
      {"when log \"Button*\" repeat 2 find 9 => next\npress next\nignore log",
       "7: expected next, got none"},
  });
}

TEST(ScenarioFailures, FilesThatAreNotThere) {
  const auto found = failure("copy a.plist no/such.plist");
  EXPECT_TRUE(found.starts_with("1: expected the file no/such.plist in /")) << found;
  EXPECT_TRUE(found.ends_with(", got none")) << found;
  const auto host = failure("host w none.plist");
  EXPECT_TRUE(host.starts_with("1: expected the description of a host's window, got /")) << host;
  EXPECT_TRUE(host.ends_with("/none.plist: no such file; expected a host's window")) << host;
  EXPECT_EQ(failure("file a text\nfile a/b text"),
            "2: expected the file a/b in the resource directory, got an error writing it");
}

TEST(ScenarioFailures, WhatNoPropertyListCanCarry) {
  const auto found = failure("script a.plist {\"CF$UID\": 1}");
  EXPECT_TRUE(found.starts_with("1: expected no exception, got NSInvalidArgumentException: "))
      << found;
}

TEST(ScenarioFailures, OneFailureEndsItsScenarioOnly) {
  const auto reports = runAll(beginning +
                              "scenario first\nexpect state 1\nexpect state 2\n"
                              "scenario second\nexpect state 0\n"
                              "scenario third\nonly qt\nexpect state 9\n");
  ASSERT_EQ(reports.size(), 3U);
  EXPECT_EQ(reports[0].verdict, Verdict::failed);
  EXPECT_EQ(reports[0].failedLine, 8);
  EXPECT_EQ(reports[0].statement, "expect state 1");
  EXPECT_EQ(reports[1].verdict, Verdict::passed);
  EXPECT_EQ(reports[2].verdict, Verdict::skipped);
  EXPECT_EQ(reports[2].problem, "only for qt");
}

}  // namespace
}  // namespace qz::tools::scenario
