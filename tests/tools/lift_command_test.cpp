// SPDX-License-Identifier: MIT
// The command `lift`.
#include <gtest/gtest.h>

#include <string>

#include "play_files.hpp"
#include "tool_run.hpp"
#include "tools/commands.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools {
namespace {

/// A script and its window.
class LiftCommand : public testing::Test {
 protected:
  LiftCommand() {
    directory_.write("host.plist",
                     "({ class = NSTextField; tag = 1; frame = (0, 40, 90, 30); },"
                     " { class = NSButton; tag = 2; frame = (0, 0, 90, 30); title = Next; })");
    directory_.write("script.plist",
                     "{ 0 = ((SET_TEXT_FOR_OBJECT_ID, Hello, 1));\n"
                     "  2 = (TERMINATE_PARSER); }");
  }

  Result lift(std::vector<std::string> arguments) const {
    arguments.insert(arguments.begin(), "lift");
    return run(liftCommand, arguments);
  }

  play::WorkingDirectory directory_;
};

TEST_F(LiftCommand, WritesASourceThatCanBeBuilt) {
  const Result result = lift({"script.plist", "--window", "host.plist"});
  EXPECT_EQ(result.err, "");
  EXPECT_EQ(result.out, "script.yaml: 1 step; built again, it is no different for users\n");
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(wholeFile("script.yaml").value_or(""),
            "window: host.plist\ncontrols: {heading: 1, next: 2}\nback over: 0\nsteps:\n"
            "  Hello: {heading: Hello, next: {press: end}}\n");
  EXPECT_EQ(run(buildCommand, {"build", "script.yaml", "-o", "again.plist"}).status, 0);
}

TEST_F(LiftCommand, NamesTheWindowFromTheDirectoryOfTheSource) {
  std::filesystem::create_directory("sources");
  EXPECT_EQ(lift({"script.plist", "--window", "host.plist", "-o", "sources/tour.yaml"}).status, 0);
  EXPECT_TRUE(
      wholeFile("sources/tour.yaml").value_or("").starts_with("window: \"../host.plist\"\n"));
}

TEST_F(LiftCommand, DoesNotReplaceASourceUnlessItIsNamed) {
  directory_.write("script.yaml", "mine");
  const Result result = lift({"script.plist", "--window", "host.plist"});
  EXPECT_EQ(result.err,
            "qz-walkthrough: script.yaml: is there already; expected -o with the file to write\n");
  EXPECT_EQ(result.status, 2);
  EXPECT_EQ(wholeFile("script.yaml").value_or(""), "mine");
  EXPECT_EQ(lift({"script.plist", "--window", "host.plist", "-o", "script.yaml"}).status, 0);
}

TEST_F(LiftCommand, SaysWhatIsMissing) {
  EXPECT_EQ(lift({"script.plist"}).err,
            "qz-walkthrough: expected --window with the host's window, or --assets; a source names "
            "it\n");
  EXPECT_EQ(lift({"script.plist", "--window", "host.plist", "--start", "7"}).err,
            "qz-walkthrough: script.plist: no list has the key “7”\n");
  EXPECT_EQ(lift({"script.plist", "--window", "host.plist", "--limit", "0"}).err,
            "qz-walkthrough: --limit: expected a whole number above 0, found “0”; see "
            "qz-walkthrough lift --help\n");
  directory_.write("tour.yaml", "steps: {}");
  EXPECT_EQ(lift({"tour.yaml", "--window", "host.plist"}).err,
            "qz-walkthrough: tour.yaml: is a walk-through in steps already\n");
}

TEST_F(LiftCommand, SaysWhereAScriptDoesWhatStepsCannot) {
  directory_.write("loop.plist", "{ 0 = ();\n  2 = ((PROCESS_COMMANDS_FOR_ID, 2)); }");
  const Result result = lift({"loop.plist", "--window", "host.plist"});
  EXPECT_EQ(
      result.err,
      "qz-walkthrough: loop.plist:2:3: list “2”: a press of the tag 2 runs lists without end\n");
  EXPECT_EQ(result.status, 1);
  EXPECT_FALSE(wholeFile("loop.yaml"));
}

TEST_F(LiftCommand, GivesUpAScriptOfTooManyPlaces) {
  const Result result = lift({"script.plist", "--window", "host.plist", "--limit", "1"});
  EXPECT_EQ(
      result.err,
      "qz-walkthrough: script.plist: the script has more places than the limit of 1; expected "
      "a higher --limit\n");
  EXPECT_EQ(result.status, 1);
}

}  // namespace
}  // namespace qz::tools
