// SPDX-License-Identifier: MIT
// The command line of `qz-walkthrough play`: exit statuses, and one line for each error.
#include <gtest/gtest.h>

#include <iostream>

#include "play_files.hpp"
#include "tool_run.hpp"
#include "tools/commands.hpp"

namespace qz::tools {
namespace {

Result run(const std::vector<std::string>& arguments) { return tools::run(playCommand, arguments); }

/// A directory with a script whose list 1 does nothing.
class PlayCommand : public testing::Test {
 protected:
  void SetUp() override { directory_.write("script.plist", "{ 1 = (IDLE_LOOP); 2 = (); }"); }

  play::WorkingDirectory directory_;
};

TEST_F(PlayCommand, BadUsageIsOneLine) {
  const std::string help = "; see qz-walkthrough play --help\n";
  const std::string toolHelp = "; see qz-walkthrough --help\n";
  const struct {
    std::vector<std::string> arguments;
    std::string line;
  } cases[] = {
      {{}, "expected a command: play" + toolHelp},
      {{"pley"}, "unknown command pley; expected play; did you mean \"play\"?" + toolHelp},
      {{"--fast"}, "unknown option --fast; expected play" + toolHelp},
      {{"play"}, "SCRIPT is required" + help},
      {{"play", "--fast"}, "unknown option --fast" + help},
      {{"play", "script.plist", "more"}, "unexpected argument more" + help},
      {{"play", "script.plist", "--pres", "1"},
       "unknown option --pres; did you mean \"--press\"?" + help},
      {{"play", "script.plist", "--press"}, "--press: expected TAG" + help},
      {{"play", "script.plist", "--start", "1", "--start", "2"},
       "--start: expected once, found 2 times" + help},
      {{"play", "script.plist", "--press", "Next"},
       "--press: expected a tag (a whole number), found “Next”" + help},
      {{"play", "script.plist", "--advance", "-1"},
       "--advance: expected seconds from 0 to 86400, found “-1”" + help},
      {{"play", "script.plist", "--window", "a", "--assets", "b"},
       "--window excludes --assets" + help},
  };
  for (const auto& c : cases) {
    const Result result = run(c.arguments);
    EXPECT_EQ(result.err, "qz-walkthrough: " + c.line);
    EXPECT_EQ(result.status, 2) << c.line;
    EXPECT_EQ(result.out, "");
  }
}

TEST_F(PlayCommand, ABadFileIsOneLine) {
  const Result missing = run({"play", "no.plist"});
  EXPECT_EQ(missing.err, "qz-walkthrough: no.plist: no such file; expected a script\n");
  EXPECT_EQ(missing.status, 2);
  const Result strange = run({"play", "a\x1b\nb"});
  EXPECT_EQ(strange.err, "qz-walkthrough: a\\u{1b}\\nb: no such file; expected a script\n");
  const Result toolkit = run({"play", "script.plist", "--toolkit", "mem"});
  EXPECT_TRUE(toolkit.err.starts_with("qz-walkthrough: unknown toolkit mem; this build has memory"))
      << toolkit.err;
  EXPECT_EQ(toolkit.status, 2);
  const Result start = run({"play", "script.plist", "--start", "7"});
  EXPECT_EQ(
      start.err,
      "qz-walkthrough: script.plist: no list under the start key “7”; expected one of 1, 2\n");
  EXPECT_EQ(start.status, 1);
}

TEST_F(PlayCommand, SaysWhatCanBeReadToBeWrong) {
  directory_.write("wrong.plist",
                   "{ 1 = ((SHOW_OBJECT_WITH_ID, 5), SHOW_OBJEC); 2 = (TERMINATE_PARSER); }");
  const auto result =
      run(playCommand, {"play", "wrong.plist", "--toolkit", "memory", "--press", "2"});
  EXPECT_EQ(result.status, 0);
  EXPECT_NE(result.err.find("wrong.plist:1:34: error: no command is called “SHOW_OBJEC”"),
            std::string::npos)
      << result.err;
  EXPECT_NE(result.err.find("[unknown-command]\n"), std::string::npos) << result.err;
  const auto without = run(
      playCommand, {"play", "wrong.plist", "--no-check", "--toolkit", "memory", "--press", "2"});
  EXPECT_EQ(without.err.find("error:"), std::string::npos) << without.err;
  EXPECT_EQ(without.out, result.out);
}

TEST_F(PlayCommand, StepsKeepTheOrderOfTheCommandLine) {
  const Result result = run({"play", "--press", "2", "1", "--advance", "0.5", "script.plist",
                             "--press", "2", "--advance=1", "--toolkit", "memory"});
  EXPECT_EQ(result.status, 0);
  std::size_t at = 0;
  for (const char* heading : {"1. start", "2. press 2", "3. press 1", "4. let 0.5 s pass",
                              "5. press 2", "6. let 1 s pass"}) {
    at = result.out.find(heading, at);
    EXPECT_NE(at, std::string::npos) << heading << "\n" << result.out;
  }
  EXPECT_EQ(result.out.find("7. "), std::string::npos);
}

TEST_F(PlayCommand, ARefusedPressIsAStatusAndALine) {
  const Result result = run({"play", "script.plist", "--toolkit", "memory", "--press", "-2"});
  EXPECT_EQ(result.status, 1);
  EXPECT_NE(result.out.find("no control has the tag -2"), std::string::npos) << result.out;
  EXPECT_TRUE(
      result.err.ends_with("qz-walkthrough: script.plist: press -2: no control has the tag "
                           "-2; press 1 (1) or 2 (2)\n"))
      << result.err;
}

TEST_F(PlayCommand, ScreenshotsNeedPixels) {
  const Result result =
      run({"play", "script.plist", "--toolkit", "memory", "--screenshots", "pictures"});
  EXPECT_EQ(result.err,
            "qz-walkthrough: --screenshots: the toolkit memory has no pixels; expected one that "
            "draws, such as --toolkit qt\n");
  EXPECT_EQ(result.status, 2);
  EXPECT_EQ(result.out, "");
}

TEST_F(PlayCommand, HelpNamesEveryOptionAndTheExitStatuses) {
  const Result help = run({"play", "--help"});
  EXPECT_EQ(help.status, 0);
  EXPECT_EQ(help.err, "");
  for (const char* part : {"SCRIPT", "--window", "--assets", "--start", "--resources", "--press",
                           "--advance", "--sheet", "--toolkit", "--screenshots", "Exit status:"}) {
    EXPECT_NE(help.out.find(part), std::string::npos) << part;
  }
  const Result version = run({"--version"});
  EXPECT_TRUE(version.out.starts_with("qz-walkthrough ")) << version.out;
  EXPECT_EQ(version.status, 0);
}

TEST_F(PlayCommand, AnOutputThatCannotBeWrittenIsOneLine) {
  const Captured err(std::cerr);
  const Captured out(std::cout);
  std::cout.setstate(std::ios::badbit);
  const int status = runTool({"play", "script.plist", "--toolkit", "memory"}, {playCommand});
  std::cout.clear();
  EXPECT_EQ(status, 1);
  EXPECT_TRUE(err.text().ends_with("qz-walkthrough: standard output cannot be written\n"))
      << err.text();
}

}  // namespace
}  // namespace qz::tools
