// SPDX-License-Identifier: MIT
// The command `cover`: what it writes into its directory, what it says, and what it leaves alone.
#include <gtest/gtest.h>

#include <filesystem>

#include "play_files.hpp"
#include "tool_run.hpp"
#include "tools/commands.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools {
namespace {

namespace fs = std::filesystem;

/// A script and its window.
class CoverCommand : public testing::Test {
 protected:
  CoverCommand() {
    directory_.write("host.plist",
                     "({ class = NSTextField; tag = 1; frame = (0, 40, 90, 30); },"
                     " { class = NSButton; tag = 2; frame = (0, 0, 90, 30); title = Next; })");
    writeScript("Hello");
  }

  void writeScript(const std::string& text) const {
    directory_.write("script.plist", "{ 0 = ((SET_TEXT_FOR_OBJECT_ID, " + text +
                                         ", 1));\n  2 = (TERMINATE_PARSER); }");
  }

  static Result cover(const std::vector<std::string>& more = {}) {
    std::vector<std::string> arguments = {
        "cover", "script.plist", "--window", "host.plist", "--start", "0", "-o", "covers"};
    arguments.insert(arguments.end(), more.begin(), more.end());
    return run(coverCommand, arguments);
  }

  /// Returns the text of the only scenario file, and its name.
  static std::string written(std::string* name = nullptr) {
    std::string text;
    for (const auto& file : fs::directory_iterator("covers")) {
      text += wholeFile(file.path().string()).value_or("");
      if (name) *name = file.path().filename().string();
    }
    return text;
  }

  play::WorkingDirectory directory_;
};

TEST_F(CoverCommand, WritesScenariosThatPass) {
  const Result result = cover();
  std::string name;
  const std::string text = written(&name);
  EXPECT_EQ(result.status, 0) << result.err;
  EXPECT_EQ(result.out, "new:     " + name + "\n1 scenarios: 2 steps, 2 moves between them\n");
  EXPECT_NE(text.find("Hello"), std::string::npos) << text;
  const Result tested = run(testCommand, {"test", "covers"});
  EXPECT_EQ(tested.out, "1 passed, 0 failed\n") << tested.err;
}

TEST_F(CoverCommand, WritesNothingOverScenariosThatDoNotFitUnlessItMay) {
  ASSERT_EQ(cover().status, 0);
  const std::string before = written();
  writeScript("Welcome");
  const Result stale = cover();
  EXPECT_EQ(stale.status, 1);
  EXPECT_TRUE(stale.out.starts_with("changed: ")) << stale.out;
  EXPECT_EQ(stale.err,
            "qz-walkthrough: the scenarios in covers do not fit the script; --update rewrites "
            "them\n");
  EXPECT_EQ(written(), before);
  EXPECT_EQ(cover({"--update"}).status, 0);
  EXPECT_NE(written().find("Welcome"), std::string::npos) << written();
  EXPECT_TRUE(cover().out.starts_with("1 scenarios: 2 steps")) << "nothing has changed since";
}

TEST_F(CoverCommand, RemovesItsOwnScenariosAndLeavesOthers) {
  ASSERT_EQ(cover().status, 0);
  const std::string own = written();
  directory_.write("covers/old.walk", own);
  directory_.write("covers/mine.walk", "scenario mine\n");
  const Result stale = cover();
  EXPECT_EQ(stale.status, 1);
  EXPECT_TRUE(stale.out.starts_with("gone:    old.walk\n")) << stale.out;
  EXPECT_TRUE(fs::exists("covers/old.walk"));
  EXPECT_EQ(cover({"--update"}).status, 0);
  EXPECT_FALSE(fs::exists("covers/old.walk"));
  EXPECT_TRUE(fs::exists("covers/mine.walk"));
}

TEST_F(CoverCommand, SaysWhatIsMissing) {
  EXPECT_EQ(run(coverCommand, {"cover", "script.plist"}).err,
            "qz-walkthrough: -o DIR is required; see qz-walkthrough cover --help\n");
  directory_.write("covers", "a file");
  EXPECT_EQ(cover().err, "qz-walkthrough: covers: expected a directory, which can be made\n");
}

}  // namespace
}  // namespace qz::tools
