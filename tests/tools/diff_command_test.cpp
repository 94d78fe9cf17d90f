// SPDX-License-Identifier: MIT
// The command `diff`.
#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include <cstdlib>
#include <string>

#include "play_files.hpp"
#include "tool_run.hpp"
#include "tools/commands.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools {
namespace {

constexpr const char* smallHost =
    "({ class = NSTextField; tag = 1; frame = (0, 40, 90, 30); },"
    " { class = NSButton; tag = 2; frame = (0, 0, 90, 30); title = Next; })";
constexpr const char* smallScript =
    "{ 0 = ((SET_TEXT_FOR_OBJECT_ID, Hello, 1));\n  2 = (TERMINATE_PARSER); }";
constexpr const char* politeScript =
    "{ 0 = ((SET_TEXT_FOR_OBJECT_ID, Welcome, 1));\n  2 = (TERMINATE_PARSER); }";

/// Two scripts and their window.
class DiffCommand : public testing::Test {
 protected:
  DiffCommand() {
    directory_.write("host.plist", smallHost);
    directory_.write("old.plist", smallScript);
    directory_.write("new.plist", politeScript);
  }

  Result diff(std::vector<std::string> arguments) const {
    arguments.insert(arguments.begin(), "diff");
    return run(diffCommand, arguments);
  }

  play::WorkingDirectory directory_;
};

TEST_F(DiffCommand, SaysWhatIsDifferent) {
  const Result result = diff({"old.plist", "new.plist", "--window", "host.plist"});
  EXPECT_EQ(result.err, "");
  EXPECT_EQ(result.out, R"(old.plist → new.plist

Words
  text field 1: text “Welcome” instead of “Hello”, at the step of list “0” (“Welcome”)
    before: qz-walkthrough play old.plist --window host.plist --start 0
    now: qz-walkthrough play new.plist --window host.plist --start 0

0 changes of behaviour and looks, 1 of words
)");
  EXPECT_EQ(result.status, 1);
}

TEST_F(DiffCommand, SaysThatNothingIsDifferent) {
  directory_.write("same.plist",
                   R"(<plist version="1.0"><dict>
    <key>2</key><array><string>TERMINATE_PARSER</string></array>
    <key>0</key><array><array><string>PROCESS_COMMANDS_FOR_ID</string><integer>9</integer></array></array>
    <key>9</key><array><array><string>SET_TEXT_FOR_OBJECT_ID</string><string>Hello</string>
      <integer>1</integer></array></array>
  </dict></plist>)");
  const Result result = diff({"old.plist", "same.plist", "--window", "host.plist"});
  EXPECT_EQ(result.out, "old.plist → same.plist\nno difference for users\n");
  EXPECT_EQ(result.status, 0);
}

TEST_F(DiffCommand, ComparesASourceWithAScript) {
  directory_.write("tour.yaml",
                   "window: host.plist\ncontrols: {heading: 1, next: 2}\nsteps:\n"
                   "  hello: {heading: Hello, next: {press: end}}\n");
  EXPECT_EQ(diff({"old.plist", "tour.yaml", "--window", "host.plist"}).status, 0);
  const Result result = diff({"tour.yaml", "new.plist", "--window", "host.plist"});
  EXPECT_NE(result.out.find("heading: text “Welcome”"), std::string::npos) << result.out;
  EXPECT_NE(result.out.find("(before: the step “hello”)"), std::string::npos) << result.out;
}

TEST_F(DiffCommand, PlaysBothInOneWindowWithoutAny) {
  const Result result = diff({"old.plist", "new.plist"});
  EXPECT_EQ(result.err, "");
  EXPECT_EQ(result.status, 1);
  directory_.write("longer.plist",
                   "{ 0 = ((SET_TEXT_FOR_OBJECT_ID, Hello, 1));\n"
                   "  2 = (TERMINATE_PARSER); 3 = (TERMINATE_PARSER); }");
  EXPECT_EQ(diff({"old.plist", "longer.plist"}).status, 1);  // a press of 3 ends it now
}

TEST_F(DiffCommand, ComparesWithTheWindowThatTheOldScriptHad) {
  directory_.write("former.plist",
                   "({ class = NSTextField; tag = 1; frame = (0, 40, 90, 30); },"
                   " { class = NSButton; tag = 2; frame = (0, 0, 90, 30); title = Go; })");
  const Result result =
      diff({"old.plist", "old.plist", "--window", "host.plist", "--old-window", "former.plist"});
  EXPECT_NE(result.out.find("button 2: title “Next” instead of “Go”"), std::string::npos)
      << result.out;
  EXPECT_NE(result.out.find("before: qz-walkthrough play old.plist --window former.plist"),
            std::string::npos)
      << result.out;
}

TEST_F(DiffCommand, ComparesWindows) {
  directory_.write("wide.plist",
                   "({ class = NSTextField; tag = 1; frame = (0, 40, 190, 30); },"
                   " { class = NSButton; tag = 2; frame = (0, 0, 90, 30); title = Next; })");
  const Result result = diff({"host.plist", "wide.plist"});
  EXPECT_EQ(result.out,
            "host.plist → wide.plist\n\nBehaviour and looks\n"
            "  text field 1: frame 190 × 30 at 0, 40 instead of 90 × 30 at 0, 40\n\n"
            "1 change of behaviour and looks, 0 of words\n");
  EXPECT_EQ(diff({"host.plist", "host.plist"}).status, 0);
}

TEST_F(DiffCommand, ComparesDescriptions) {
  directory_.write("one.plist",
                   "{ window = (NSWindow, 0, 0, 200, 100); ok = (NSButton, 0, 0, 50, 20); }");
  directory_.write("two.plist",
                   "{ window = (NSWindow, 0, 0, 200, 100); ok = (NSButton, 9, 0, 50, 20); }");
  const Result result = diff({"one.plist", "two.plist"});
  EXPECT_NE(result.out.find("frame 50 × 20 at 9, 0 instead of 50 × 20 at 0, 0"), std::string::npos)
      << result.out << result.err;
}

TEST_F(DiffCommand, WritesJson) {
  const Result result =
      diff({"old.plist", "new.plist", "--window", "host.plist", "--format", "json"});
  const auto json = nlohmann::json::parse(result.out);
  EXPECT_EQ(json["words"][0]["old"], "“Hello”");
  EXPECT_TRUE(json["findings"]["came"].empty());
  EXPECT_EQ(result.status, 1);
}

TEST_F(DiffCommand, SaysThatNotEverythingWasCompared) {
  const Result result = diff({"old.plist", "old.plist", "--window", "host.plist", "--limit", "1"});
  EXPECT_EQ(result.out,
            "old.plist → old.plist\nno difference was found; not everything was compared: --limit "
            "was reached\n");
  EXPECT_EQ(result.status, 3);
}

// Everything is explored, but two steps and three in turn are six pairs.
TEST_F(DiffCommand, SaysThatNotAllPairsOfStepsWereCompared) {
  directory_.write("two.plist",
                   "{ 2 = ((SET_TAG_FOR_OBJECT_ID, 3, 2)); 3 = ((SET_TAG_FOR_OBJECT_ID, 2, 3)); }");
  directory_.write("three.plist",
                   "{ 2 = ((SET_TAG_FOR_OBJECT_ID, 3, 2)); 3 = ((SET_TAG_FOR_OBJECT_ID, 4, 3));"
                   "  4 = ((SET_TAG_FOR_OBJECT_ID, 2, 4)); }");
  const auto after = [&](const std::string& limit) {
    return diff({"two.plist", "three.plist", "--window", "host.plist", "--limit", limit});
  };
  const Result limited = after("5");
  EXPECT_NE(limited.out.find("no difference was found; not everything was compared"),
            std::string::npos)
      << limited.out;
  EXPECT_EQ(limited.status, 3);
  EXPECT_EQ(after("6").status, 0);
}

TEST_F(DiffCommand, SaysWhatIsWrong) {
  EXPECT_EQ(diff({"old.plist", "new.plist", "old.plist"}).err,
            "qz-walkthrough: expected OLD and NEW, or the seven or nine words of git, found 3\n");
  EXPECT_EQ(diff({"old.plist", "new.plist", "--limit", "0"}).err,
            "qz-walkthrough: --limit: expected a whole number above 0, found “0”; see "
            "qz-walkthrough diff --help\n");
  EXPECT_EQ(diff({"old.plist"}).err,
            "qz-walkthrough: expected OLD and NEW, found only “old.plist”\n");
  EXPECT_EQ(diff({"old.plist", "missing.plist"}).err,
            "qz-walkthrough: missing.plist: no such file; expected a script or a window\n");
  EXPECT_EQ(diff({"old.plist", "host.plist"}).err,
            "qz-walkthrough: old.plist: expected a window, as the other file is one, found a "
            "script\n");
  EXPECT_EQ(diff({"old.plist", "new.plist", "--old-window", "host.plist"}).err,
            "qz-walkthrough: new.plist: expected its window, as the other script has one; name it "
            "with --window or --assets, that of the old script alone with --old-window or "
            "--old-assets\n");
  EXPECT_EQ(diff({"old.plist", "new.plist", "--start", "7"}).err,
            "qz-walkthrough: old.plist: no list under the start key “7”; expected one of 0 or "
            "2\n");
  const Result format = diff({"old.plist", "new.plist", "--format", "xml"});
  EXPECT_EQ(format.err, "qz-walkthrough: --format: expected text or json, found “xml”\n");
  EXPECT_EQ(format.status, 2);
}

/// A repository of git with an old script, in a directory of its own.
class DiffForGit : public DiffCommand {
 protected:
  DiffForGit() {
    shell("git init -q . && git config user.name Tester && git config user.email t@example.org");
    shell("echo '*.plist diff=walkthrough' > .gitattributes");
    shell("git config diff.walkthrough.command '" QZ_TOOL_DIRECTORY
          "/qz-walkthrough diff --window host.plist'");
    directory_.write("tour.plist", smallScript);
    shell("git add . && git commit -q -m 'Add the tour'");
  }

  static int shell(const std::string& command) { return std::system(command.c_str()); }

  /// Returns what a command prints. It must succeed.
  static std::string printed(const std::string& command) {
    EXPECT_EQ(shell(command + " > printed 2>&1"), 0) << wholeFile("printed").value_or("");
    return wholeFile("printed").value_or("");
  }
};

TEST_F(DiffForGit, IsItsDiffDriver) {
  directory_.write("tour.plist", politeScript);
  const std::string text = printed("git diff");
  EXPECT_NE(text.find("text field 1: text “Welcome” instead of “Hello”"), std::string::npos)
      << text;
  EXPECT_TRUE(text.starts_with("tour.plist@")) << text;
  EXPECT_NE(text.find(" → tour.plist\n"), std::string::npos) << text;
}

TEST_F(DiffForGit, GoesOnAfterAFileThatIsNoWalkThrough) {
  directory_.write("broken.plist", "{ 0 = (");
  directory_.write("tour.plist", politeScript);
  shell("git add . && git rm -q --cached old.plist");
  const std::string text = printed("git diff HEAD");
  EXPECT_NE(text.find("broken.plist: is new\n"), std::string::npos) << text;
  EXPECT_NE(text.find(": is gone\n"), std::string::npos) << text;
  EXPECT_NE(text.find("Welcome"), std::string::npos) << text;
  shell("git commit -q -m 'Break' && echo '{ 0 = ((' > broken.plist");
  EXPECT_NE(printed("git diff").find("broken.plist: cannot be compared: "), std::string::npos);
}

TEST_F(DiffForGit, HasNoCommandLineForAVersionThatIsNotOnDisk) {
  directory_.write("tour.plist", politeScript);
  const std::string text = printed("git diff");
  EXPECT_NE(text.find("    before: --start 0\n"), std::string::npos) << text;
  EXPECT_NE(text.find("    now: qz-walkthrough play tour.plist --window host.plist --start 0\n"),
            std::string::npos)
      << text;
}

TEST_F(DiffForGit, IsItsExternalDiff) {
  directory_.write("tour.yaml",
                   "window: host.plist\ncontrols: {heading: 1, next: 2}\nsteps:\n"
                   "  hello: {heading: Hello, next: {press: end}}\n");
  shell("git add . && git commit -q -m 'Add a source'");
  shell("sed -i s/Hello/Welcome/ tour.yaml");
  const std::string text =
      printed("GIT_EXTERNAL_DIFF='" QZ_TOOL_DIRECTORY "/qz-walkthrough diff' git diff tour.yaml");
  EXPECT_NE(text.find("heading: text “Welcome” instead of “Hello”, at the step “hello”"),
            std::string::npos)
      << text;
}

TEST_F(DiffForGit, KnowsAFileThatWasRenamed) {
  std::string filling = "\n";  // so that git sees that the files are alike
  for (int i = 0; i < 20; ++i) filling += "/* line " + std::to_string(i) + " */\n";
  directory_.write("tour.plist", smallScript + filling);
  shell("git commit -qam Lengthen && git mv tour.plist visit.plist");
  directory_.write("visit.plist", politeScript + filling);
  shell("git commit -qam Rename");
  const std::string text = printed("git diff HEAD~");
  EXPECT_TRUE(text.starts_with("tour.plist@")) << text;
  EXPECT_NE(text.find(" → visit.plist@"), std::string::npos) << text;
  EXPECT_NE(text.find("“Welcome” instead of “Hello”"), std::string::npos) << text;
}

}  // namespace
}  // namespace qz::tools
