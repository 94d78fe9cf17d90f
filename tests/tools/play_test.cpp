// SPDX-License-Identifier: MIT
// Playing scripts from the first step to the end of the transcript.
#include "tools/play/play.hpp"

#include <gtest/gtest.h>

#include <sstream>

#include "play_files.hpp"
#include "play_support.hpp"

namespace qz::tools::play {
namespace {

struct Played {
  ExitStatus status;
  std::string transcript;
  std::string log;
};

Played run(const PlayOptions& options, const std::string& typed = "", bool interactive = false) {
  std::istringstream in(typed);
  std::ostringstream out;
  std::ostringstream log;
  const ExitStatus status = play(options, {in, out, log, interactive, {}});
  return {status, out.str(), log.str()};
}

std::string refusal(const PlayOptions& options, ExitStatus status = ExitStatus::badInput) {
  try {
    run(options);
  } catch (const Failure& failure) {
    EXPECT_EQ(failure.status(), status);
    return failure.what();
  }
  return "accepted";
}

/// Returns the headings of a transcript, without the rules that fill their lines.
std::string headings(const std::string& transcript) {
  std::istringstream lines(transcript);
  std::string found;
  for (std::string line; std::getline(lines, line);) {
    if (!line.starts_with("── ")) continue;
    found += line.substr(0, line.find(" ──", 3)) + "\n";
  }
  return found;
}

PlayOptions firstSteps() {
  const std::string directory = std::string(QZ_SOURCE_DIR) + "/examples/first-steps/";
  PlayOptions options;
  options.script = std::string(QZ_TEST_DATA) + "/scripts/first-steps.plist";
  options.stage.window = directory + "host.plist";
  options.resources = directory;
  return options;
}

/// Writes a script into the working directory: list 1 sets a title, 2 starts a timer, 3 ends the
/// walk-through, and 4 is not a list, so that it raises.
PlayOptions smallScript(const WorkingDirectory& directory) {
  directory.write("script.plist",
                  "{ 1 = (IDLE_LOOP, (SET_TITLE_FOR_OBJECT_ID, Go, 1));"
                  "  2 = ((SET_TIMER_FOR_ID, 3, 1), (SET_TOOL_TIP_FOR_ID, Help));"
                  "  3 = (TERMINATE_PARSER);"
                  "  4 = text; }");
  PlayOptions options;
  options.script = "script.plist";
  return options;
}

TEST(Play, TheFirstStepsToTheirEnd) {
  PlayOptions options = firstSteps();
  options.steps = {Press{12}, Press{5}, Press{13}, Press{14}, Advance{2}, Advance{2.5}, Press{16}};
  const Played played = run(options);
  EXPECT_EQ(played.status, ExitStatus::fine);
  EXPECT_EQ(played.transcript, playData("first-steps.txt"));
  EXPECT_EQ(played.log, playData("first-steps.log.txt"));
}

TEST(Play, StepsKeepTheirOrder) {
  const WorkingDirectory directory;
  PlayOptions options = smallScript(directory);
  options.steps = {Press{2}, Advance{3}, Press{2}, Press{3}};
  const Played played = run(options);
  EXPECT_EQ(headings(played.transcript),
            "── 1. start\n── 2. press 2 (2)\n── 3. let 3 s pass\n── 4. press 2 (2)\n"
            "── 5. press 3 (3)\n");
  EXPECT_TRUE(played.transcript.ends_with(
      "\nThe walk-through ended.\nButton states recorded: 2 off, 1 off, 3 off.\n"));
}

TEST(Play, APressThatNoUserCouldMakeIsRefused) {
  const WorkingDirectory directory;
  PlayOptions options = smallScript(directory);
  options.steps = {Press{9}, Press{3}, Press{1}, Advance{1}};
  const Played played = run(options);
  EXPECT_EQ(played.status, ExitStatus::failed);
  const std::string expected[] = {
      "  Not possible: no control has the tag 9; press 1 (Go), 2 (2), 3 (3) or 4 (4).\n",
      "── 4. press 1 (Go) ",
      "  Not possible: the walk-through has ended.\n\n── 5. let 1 s pass ──",
  };
  for (const std::string& part : expected) {
    EXPECT_NE(played.transcript.find(part), std::string::npos) << part << played.transcript;
  }
}

TEST(Play, WhatAListRaisesIsReportedAndTheWalkThroughGoesOn) {
  const WorkingDirectory directory;
  PlayOptions options = smallScript(directory);
  options.steps = {Press{4}, Press{2}};
  const Played played = run(options);
  EXPECT_EQ(played.status, ExitStatus::failed);
  EXPECT_NE(played.transcript.find("  Raised NSInvalidArgumentException: "), std::string::npos);
  EXPECT_NE(played.log.find("qz-walkthrough: script.plist: press 4 (4): raised NSInvalid"),
            std::string::npos)
      << played.log;
  EXPECT_NE(played.transcript.find("\n── 3. press 2 (2) ──"), std::string::npos);
}

TEST(Play, SaysWhereACommandStandsThatRaised) {
  const WorkingDirectory directory;
  directory.write("script.plist",
                  "{ 1 = (IDLE_LOOP,\n  (PROCESS_COMMANDS_FOR_ID, 2));\n"
                  "  2 = (IDLE_LOOP, IDLE_LOOP,\n    (SET_TITLE_FOR_OBJECT_ID, Go)); }");
  PlayOptions options;
  options.script = "script.plist";
  options.steps = {Press{1}};
  const std::string raised =
      "Exception in processCommandArray: -[NSArray objectAtIndex:]: index 1 beyond bounds [0 .. "
      "0]\n"
      "  script.plist:4:5: list 2, command 3: SET_TITLE_FOR_OBJECT_ID\n";
  const std::string log = run(options).log;
  EXPECT_TRUE(log.ends_with(raised + "Button tag 1 pressed.\n" + raised)) << log;
}

TEST(Play, AWalkThroughThatStandsStillHasFailed) {
  const WorkingDirectory directory;
  PlayOptions options;
  options.script = "script.plist";
  const std::string line =
      "qz-walkthrough: script.plist: the walk-through is stuck: no timer is pending, and no "
      "button that can be pressed has a list\n";
  directory.write("script.plist", "{ 1 = (DISABLE_OBJECT_WITH_ID); }");
  const Played stuck = run(options);
  EXPECT_EQ(stuck.status, ExitStatus::failed);
  EXPECT_TRUE(stuck.log.ends_with(line)) << stuck.log;
  EXPECT_NE(stuck.transcript.find("\nThe walk-through is stuck: "), std::string::npos);
  // With a timer pending, or after its end, a walk-through has not failed.
  directory.write("script.plist", "{ 1 = (DISABLE_OBJECT_WITH_ID, (SET_TIMER_FOR_ID, 2, 1)); }");
  EXPECT_EQ(run(options).status, ExitStatus::fine);
  directory.write("script.plist", "{ 1 = (IDLE_LOOP); 2 = (TERMINATE_PARSER); }");
  options.steps = {Press{2}};
  const Played ended = run(options);
  EXPECT_EQ(ended.status, ExitStatus::fine);
  EXPECT_EQ(ended.log.find("is stuck"), std::string::npos);
}

TEST(Play, ASheetLeavesTheScreenWhenItEnds) {
  const WorkingDirectory directory;
  PlayOptions options = smallScript(directory);
  options.stage.sheet = true;
  options.steps = {Press{3}};
  const std::string transcript = run(options).transcript;
  const std::size_t end = transcript.find("── 2.");
  EXPECT_NE(transcript.find("a sheet of the host's window"), std::string::npos);
  EXPECT_NE(transcript.find("↳ sheet: no → yes"), std::string::npos);
  EXPECT_NE(transcript.find("↳ on the screen: yes → no", end), std::string::npos) << transcript;
}

TEST(Play, TheEngineBuildsTheWindowFromADescription) {
  const WorkingDirectory directory;
  PlayOptions options = smallScript(directory);
  directory.write("assets.plist",
                  "{ 1 = (NSButton, 20, 20, 100, 30); 2 = (Unknown, 0, 0, 0, 0); }");
  options.stage.assets = "assets.plist";
  options.steps = {Press{1}};
  const Played played = run(options);
  EXPECT_EQ(played.status, ExitStatus::fine);
  EXPECT_NE(played.transcript.find("  Window: 640 × 480, on the screen, background black\n"),
            std::string::npos)
      << played.transcript;
}

TEST(Play, TheResourcesAreTheScriptsOwnDirectoryUnlessNamed) {
  const WorkingDirectory directory;
  std::filesystem::create_directory("images");
  directory.write("images/disk.png", "not looked into");
  directory.write("script.plist", "{ 1 = ((LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID, disk, 7)); }");
  PlayOptions options;
  options.script = "script.plist";
  EXPECT_NE(run(options).transcript.find("7  image   (none)"), std::string::npos);
  options.resources = "images";
  EXPECT_NE(run(options).transcript.find("7  image   disk"), std::string::npos);
}

TEST(Play, InteractivelyAsksUntilTheEnd) {
  const WorkingDirectory directory;
  const Played played = run(smallScript(directory), "7\nnext\n\n?\n+x\n2\n+3\n3\n1\n", true);
  EXPECT_EQ(played.status, ExitStatus::fine);
  EXPECT_EQ(played.transcript, playData("interactive.txt"));
}

TEST(Play, InteractivelyStopsWhenAskedToOrLeftAlone) {
  const WorkingDirectory directory;
  const std::string end = "The walk-through waits for a press of 1 (Go), 2 (2), 3 (3) or 4 (4).\n";
  EXPECT_TRUE(run(smallScript(directory), "q\n3\n", true).transcript.ends_with("\n" + end));
  EXPECT_TRUE(run(smallScript(directory), "", true).transcript.ends_with("\n" + end));
}

TEST(Play, AsksForNothingWhenNobodyIsThere) {
  const WorkingDirectory directory;
  PlayOptions options = smallScript(directory);
  EXPECT_EQ(headings(run(options, "3\n", false).transcript), "── 1. start\n");
  options.steps = {Press{2}};
  EXPECT_EQ(headings(run(options, "3\n", true).transcript), "── 1. start\n── 2. press 2 (2)\n");
}

TEST(Play, SaysWhatIsWrongWithTheStart) {
  const WorkingDirectory directory;
  PlayOptions options = smallScript(directory);
  options.startKey = "9";
  EXPECT_EQ(refusal(options, ExitStatus::failed),
            "script.plist: no list under the start key “9”; expected one of 1, 2, 3, 4");
  options.startKey = "4";
  EXPECT_EQ(
      refusal(options),
      "script.plist:1:146: start key “4”: expected a list of commands, found the string “text”");
  options.startKey = "";
  directory.write("script.plist", "{ 10 = (); 007 = (); abc = (); }");
  EXPECT_EQ(refusal(options, ExitStatus::failed),
            "script.plist: no list under the start key “0”; expected one of abc, 007, 10");
  directory.write("script.plist", "{}");
  EXPECT_EQ(refusal(options),
            "script.plist:1:1: expected at least one list, found an empty script");
}

TEST(Play, SaysWhatIsWrongWithADescription) {
  const WorkingDirectory directory;
  PlayOptions options = smallScript(directory);
  options.stage.assets = "assets.plist";
  const struct {
    std::string text;
    std::string message;
  } cases[] = {
      {"()", ":1:1: expected a description of a window (a dictionary), found an empty array"},
      {"{}", ":1:1: expected at least one entry, found an empty dictionary"},
      {"{1 = text;}",
       ":1:6: entry “1”: expected an array of a class name and four numbers, found the string "
       "“text”"},
      {"{1 = (NSButton, 0, 0, 0);}",
       ":1:6: entry “1”: expected an array of a class name and four numbers, found an array of 4"},
      {"{1 = ((), 0, 0, 0, 0);}",
       ":1:7: entry “1”: expected a class name first, found an empty array"},
      {"{1 = (NSButton, 0, 0, {}, 0);}",
       ":1:23: entry “1”: element 3: expected a number, found an empty dictionary"},
  };
  for (const auto& c : cases) {
    directory.write("assets.plist", c.text);
    EXPECT_EQ(refusal(options), "assets.plist" + c.message) << c.text;
  }
}

TEST(Play, SaysWhatIsWrongWithAFile) {
  const WorkingDirectory directory;
  PlayOptions options;
  options.script = "missing.plist";
  EXPECT_EQ(refusal(options), "missing.plist: no such file; expected a script");
  options.script = "";
  EXPECT_EQ(refusal(options), "empty path; expected the path of a script");
  options.script = ".";
  EXPECT_EQ(refusal(options), ".: a directory; expected a script");
  options = smallScript(directory);
  options.stage.window = "host.plist";
  EXPECT_EQ(refusal(options), "host.plist: no such file; expected a host's window");
  options = smallScript(directory);
  options.resources = "images";
  EXPECT_EQ(refusal(options), "images: no such directory; expected one with images");
  options.resources = options.script;
  EXPECT_EQ(refusal(options), options.script + ": no directory; expected one with images");
  options = {};
  options.script = "script.plist";
  directory.write("script.plist", "{ 1 = (");
  EXPECT_EQ(refusal(options),
            "script.plist:1:8: expected ',' or ')', found the end of the file (read as old-style "
            "property list)");
  directory.write("script.plist", "");
  EXPECT_EQ(refusal(options), "script.plist: an empty file; expected a script");
  directory.write("script.plist", "(a)");
  EXPECT_EQ(refusal(options),
            "script.plist:1:1: expected a script (a dictionary), found an array of 1");
}

}  // namespace
}  // namespace qz::tools::play
