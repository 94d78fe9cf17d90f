// SPDX-License-Identifier: MIT
// The command line of `qz-walkthrough test`: what it runs, prints and leaves behind.
#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <regex>
#include <sstream>
#include <string>
#include <utility>
#include <vector>

#include "play_files.hpp"
#include "tool_run.hpp"
#include "tools/commands.hpp"
#include "tools/support/drivers.hpp"
#include "tools/support/suggestions.hpp"

namespace qz::tools {
namespace {

namespace fs = std::filesystem;

const std::string data = QZ_TEST_DATA "/scenarios/";

std::string withoutFolder(std::string text) {
  for (auto at = text.find(data); at != std::string::npos; at = text.find(data)) {
    text.erase(at, data.size());
  }
  return text;
}

/// Runs the tool, and removes the folder of the test's files from its output.
Result runTest(const std::vector<std::string>& arguments) {
  Result result = run(testCommand, arguments);
  return {result.status, withoutFolder(std::move(result.out)),
          withoutFolder(std::move(result.err))};
}

/// Provides a temporary working directory.
class ScenarioCommand : public testing::Test {
 protected:
  void write(const std::string& name, const std::string& text) const {
    const auto folder = fs::path(name).parent_path();
    if (!folder.empty()) fs::create_directories(folder);
    directory_.write(name, text);
  }

  play::WorkingDirectory directory_;
};

TEST_F(ScenarioCommand, SaysWhatCanBeReadToBeWrongInScriptFiles) {
  write("wrong.plist", "{ 1 = (SHOW_OBJEC); }");
  write("a.walk", "copy s.plist wrong.plist\nwindow w\nengine w\nload s.plist from 1\n");
  const auto result = runTest({"test", "a.walk"});
  EXPECT_EQ(result.err.find("wrong.plist:1:8: error: no command is called “SHOW_OBJEC”"), 0U)
      << result.err;
  EXPECT_EQ(runTest({"test", "a.walk", "--no-check"}).err, "");
}

TEST_F(ScenarioCommand, IgnoresMistakesOfScriptsInScenarios) {
  write("a.walk",
        "script s.plist {\"1\": [\"SHOW_OBJEC\"]}\nwindow w\nengine w\nload s.plist from 1\n");
  EXPECT_EQ(runTest({"test", "a.walk"}).err, "");
}

TEST_F(ScenarioCommand, PrintsFailuresAndCounts) {
  const auto result = runTest({"test", data + "failing.walk"});
  EXPECT_EQ(result.status, 1);
  EXPECT_EQ(result.err, "");
  EXPECT_EQ(result.out,
            "failing.walk:10: expected \"Well done\", got \"\"\n"
            "    expect label.text \"Well done\"\n"
            "    in failing.walk:9: this one fails\n"
            "failing.walk:14: expected no further log line, got \"Found tag value: 5 for object: "
            "NSTextField using Key: 5\" logged in line 14\n"
            "    adopt panel => YES\n"
            "    in failing.walk:13: this one fails in the common beginning's wake\n"
            "failing.walk:21: expected {\"5\":[]}, got {} (they differ at .5)\n"
            "    expect engine.guiAssets { …\n"
            "    in failing.walk:20: the text over several lines is shortened\n"
            "1 passed, 3 failed, 1 skipped\n");
}

TEST_F(ScenarioCommand, AFileThatIsOneScenario) {
  const auto result = runTest({"test", data + "whole-file.walk"});
  EXPECT_EQ(result.status, 1);
  EXPECT_EQ(result.out,
            "whole-file.walk:3: expected \"7\", got \"0\"\n    expect state 7\n"
            "0 passed, 1 failed\n");
}

TEST_F(ScenarioCommand, WhatPassesIsOnlyCounted) {
  write("a.walk", "engine\nexpect state 0\n");
  const auto result = runTest({"test", "a.walk", "a.walk"});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.out, "1 passed, 0 failed\n");
}

TEST_F(ScenarioCommand, NothingRunsWhenAFileIsRefused) {
  const auto result =
      runTest({"test", data + "failing.walk", data + "refused.walk", data + "none.walk"});
  EXPECT_EQ(result.status, 2);
  EXPECT_EQ(result.out, "");
  EXPECT_EQ(result.err,
            "none.walk: no such file or directory; expected a scenario file (.walk)\n"
            "refused.walk:3:3: unknown statement \"controll\"; did you mean \"control\"?\n");
}

TEST_F(ScenarioCommand, DirectoriesStandForTheScenariosBelow) {
  write("b/two.walk", "engine\nexpect state 1\n");
  write("a.walk", "engine\nexpect state 2\n");
  write("b/notes.txt", "no scenario");
  const auto result = runTest({"test", "."});
  EXPECT_EQ(result.status, 1);
  EXPECT_EQ(result.out,
            "./a.walk:2: expected \"2\", got \"0\"\n    expect state 2\n"
            "./b/two.walk:2: expected \"1\", got \"0\"\n    expect state 1\n"
            "0 passed, 2 failed\n");
  fs::create_directories("empty");
  EXPECT_EQ(runTest({"test", "empty"}).err, "empty: no .walk file in or below this directory\n");
}

TEST_F(ScenarioCommand, ListsAndFilters) {
  const auto list = runTest({"test", "--list", "--filter", "fails", data + "failing.walk"});
  EXPECT_EQ(list.status, 0);
  EXPECT_EQ(list.out,
            "failing.walk:9: this one fails\n"
            "failing.walk:13: this one fails in the common beginning's wake\n");
  EXPECT_EQ(runTest({"test", "--filter", "passes", data + "failing.walk"}).out,
            "1 passed, 0 failed\n");
}

TEST_F(ScenarioCommand, AFilterThatNothingFitsFails) {
  const auto result = runTest({"test", "--filter", "nothing", data + "failing.walk"});
  EXPECT_EQ(result.status, 2);
  EXPECT_EQ(result.err, "qz-walkthrough: no scenario has \"nothing\" in its title\n");
}

TEST_F(ScenarioCommand, VerboselyEveryStatementIsPrinted) {
  write("a.walk",
        "window w\nengine\nadopt w => NO\nfind 5 => none\n"
        "compound FLASH_ID [] for 1 => raises\n");
  EXPECT_EQ(runTest({"test", "--verbose", "a.walk"}).out,
            "# a.walk\n"
            "a.walk:1: window w  [ok]\n"
            "a.walk:2: engine  [ok]\n"
            "a.walk:3: adopt w => NO  [NO]\n"
            "a.walk:4: find 5 => none  [none]\n"
            "a.walk:5: compound FLASH_ID [] for 1 => raises  [raised NSRangeException: -[NSArray "
            "objectAtIndex:]: index 1 beyond bounds for empty array]\n"
            "1 passed, 0 failed\n");
}

TEST_F(ScenarioCommand, WhatWouldDisturbATerminalIsWrittenOut) {
  write("a.walk", "engine\nexpect state \"\u009b\"\nscenario x\nengine\n");
  EXPECT_EQ(runTest({"test", "a.walk"}).out,
            "a.walk:2: expected \"\\u{9b}\", got \"0\"\n    expect state \"\\u{9b}\"\n"
            "    in a.walk:3: x\n0 passed, 1 failed\n");
}

TEST_F(ScenarioCommand, BadUsageIsOneLine) {
  write("a.walk", "engine\n");
  const auto names = driverNames();
  const std::string toolkits = enumerate({names.begin(), names.end()});
  const struct {
    std::vector<std::string> arguments;
    std::string line;
  } cases[] = {
      {{"test", "--toolkit", "memry", "a.walk"},
       "unknown toolkit memry; this build has " + toolkits + "; did you mean \"memory\"?"},
      {{"test", "--junit", "no/report.xml", "a.walk"},
       "no/report.xml: the report cannot be written"},
      {{"test", "--verbos", "a.walk"},
       "unknown option --verbos; did you mean \"--verbose\"?; see qz-walkthrough test --help"},
      {{"test", "--list=3", "a.walk"}, "--list: expected no value; see qz-walkthrough test --help"},
      {{"test", ""}, "FILE: expected a path, found an empty text; see qz-walkthrough test --help"},
      {{"test", "a.walk", "--junit", ""},
       "--junit: expected a path, found an empty text; see qz-walkthrough test --help"},
      {{"test"}, "FILE is required; see qz-walkthrough test --help"},
  };
  for (const auto& test : cases) {
    const auto result = runTest(test.arguments);
    EXPECT_EQ(result.status, 2) << test.line;
    EXPECT_EQ(result.err, "qz-walkthrough: " + test.line + "\n");
    EXPECT_EQ(result.out, "");
  }
}

TEST_F(ScenarioCommand, WritesAReport) {
  EXPECT_EQ(runTest({"test", "--junit", "report.xml", data + "failing.walk"}).status, 1);
  std::stringstream xml;
  xml << std::ifstream("report.xml").rdbuf();
  const std::regex suite(
      "<testsuite name=\"[^\"]*failing.walk\" tests=\"5\" failures=\"3\" "
      "errors=\"0\" skipped=\"1\" time=\"[0-9]+[.][0-9]{6}\">");
  EXPECT_TRUE(std::regex_search(xml.str(), suite)) << xml.str();
}

TEST_F(ScenarioCommand, ResourceDirectoriesAreRemoved) {
  write("a.walk",
        "script deep/er/intro.plist {}\nimage star\nengine\n"
        "scenario passes\nload deep/er/intro.plist => YES\n"
        "scenario fails\nexpect state 1\n");
  fs::create_directories("temporary");
  // A separate directory, because other tests may be running at the same time.
  const auto before = fs::temp_directory_path();
  ::setenv("TMPDIR", fs::absolute("temporary").c_str(), 1);
  const auto result = runTest({"test", "a.walk"});
  ::setenv("TMPDIR", before.c_str(), 1);
  EXPECT_NE(result.out.find("1 passed, 1 failed\n"), std::string::npos) << result.out;
  EXPECT_TRUE(fs::is_empty("temporary"));
}

TEST_F(ScenarioCommand, WithoutADirectoryForTemporaryFilesNothingRuns) {
  write("a.walk", "engine\n");
  const auto before = fs::temp_directory_path();
  ::setenv("TMPDIR", fs::absolute("nowhere").c_str(), 1);
  const auto result = runTest({"test", "a.walk"});
  ::setenv("TMPDIR", before.c_str(), 1);
  EXPECT_EQ(result.status, 1);
  EXPECT_TRUE(
      result.err.starts_with("qz-walkthrough: cannot make a directory for temporary files: "))
      << result.err;
}

}  // namespace
}  // namespace qz::tools
