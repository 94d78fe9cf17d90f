// SPDX-License-Identifier: MIT
// Scripts and windows that are made to exhaust a check: it stays within its limits, and says what
// it left out.

#include <gtest/gtest.h>

#include <chrono>
#include <sstream>

#include "qz/property_list/scalars.hpp"
#include "tests/check/checking.hpp"
#include "tests/tools/play_files.hpp"
#include "tools/check/report.hpp"

namespace qz::tools::check {
namespace {

/// One entry of a window's file.
std::string buttonEntry(Tag tag) {
  return "{ class = NSButton; tag = " + std::to_string(tag) + "; frame = (0, 0, 9, 9); }";
}
std::string fieldEntry(Tag tag) {
  return "{ class = NSTextField; tag = " + std::to_string(tag) + "; frame = (0, 0, 9, 9); }";
}

class HostileScripts : public testing::Test {
 protected:
  /// Writes a script whose buttons are switches, each of which is in one of two states whatever the
  /// others are: 2 to the power of `count` places.
  void writeSwitches(int count) const {
    std::string script = "{ 1 = (IDLE_LOOP); 2 = (TERMINATE_PARSER);\n";
    std::string window = "( " + buttonEntry(2);
    for (int i = 0; i < count; ++i) {
      const std::string off = std::to_string(1000 + i);
      const std::string on = std::to_string(2000 + i);
      script += off + " = ((SET_TAG_FOR_OBJECT_ID, " + on + ", " + off + ")); " + on +
                " = ((SET_TAG_FOR_OBJECT_ID, " + off + ", " + on + "));\n";
      window += ",\n" + buttonEntry(1000 + i);
    }
    directory_.write("script.plist", script + "}");
    directory_.write("window.plist", window + ")");
  }

  /// Returns the last line of the report.
  static std::string summaryOf(const Verdict& verdict) {
    std::ostringstream out;
    const InputFile file("script.plist", "a script");
    writeText({.scripts = {{verdict, file, "", Severity::warning}}, .unchecked = {}}, false, out);
    const std::string text = out.str();
    const auto lineEnd = text.find_last_not_of('\n');
    return text.substr(text.rfind('\n', lineEnd) + 1);
  }

  play::WorkingDirectory directory_;
};

constexpr int switches = 64;

TEST_F(HostileScripts, StopAtTheLimitOfPlaces) {
  writeSwitches(switches);
  CheckOptions options;
  options.limits.places = 300;
  const Verdict verdict = checkFolder("", options);
  EXPECT_FALSE(verdict.explored.complete);
  EXPECT_EQ(verdict.explored.stop, Stop::places);
  EXPECT_GE(verdict.explored.places, 300U);
  EXPECT_LE(verdict.explored.places, 300U + switches + 1) << "the moves of one more place at most";
  EXPECT_GT(verdict.explored.frontier, 0U);
  EXPECT_NE(summaryOf(verdict).find("not everything: --limit"), std::string::npos)
      << summaryOf(verdict);
}

TEST_F(HostileScripts, StopAtTheLimitOfMemory) {
  writeSwitches(switches);
  CheckOptions options;
  options.limits.bytes = std::size_t{64} << 10U;
  const Verdict verdict = checkFolder("", options);
  EXPECT_EQ(verdict.explored.stop, Stop::memory);
  EXPECT_LT(verdict.explored.places, 10'000U);
  EXPECT_NE(summaryOf(verdict).find("not everything: --memory"), std::string::npos);
}

TEST_F(HostileScripts, StopWhenTheTimeIsOver) {
  writeSwitches(switches);
  CheckOptions options;
  options.limits.seconds = 1e-9;
  const Verdict verdict = checkFolder("", options);
  EXPECT_EQ(verdict.explored.stop, Stop::time);
  EXPECT_EQ(verdict.explored.places, 1U) << "where the start leads";
}

TEST_F(HostileScripts, SayNothingThatNeedsTheRest) {
  writeSwitches(switches);
  CheckOptions options;
  options.limits.places = 2;
  const Verdict verdict = checkFolder("", options);
  EXPECT_FALSE(verdict.explored.complete);
  EXPECT_EQ(codesOf(verdict), std::set<std::string>()) << messagesOf(verdict);
}

TEST_F(HostileScripts, AreStoppedByTheCaller) {
  writeSwitches(switches);
  int asked = 0;
  ExplorationHooks hooks;
  hooks.isCancelled = [&] { return ++asked > 2; };
  CheckOptions options;
  options.toolkit = testToolkit();
  options.stage.window = "window.plist";
  const Verdict verdict = check::checkScript(InputFile("script.plist", "a script"), options, hooks);
  EXPECT_EQ(verdict.explored.stop, Stop::cancelled);
  EXPECT_GT(verdict.explored.places, 1U) << "what is known is kept";
  EXPECT_NE(summaryOf(verdict).find("not everything: you stopped it"), std::string::npos);
}

TEST_F(HostileScripts, HaveWindowsOfTenThousandControls) {
  std::string window = "( " + buttonEntry(2);
  for (int tag = 100; tag < 10'100; ++tag) window += ",\n" + fieldEntry(tag);
  directory_.write("window.plist", window + ")");
  directory_.write("script.plist",
                   "{ 1 = ((HIDE_OBJECT_WITH_ID, 10099)); 2 = ((SHOW_OBJECT_WITH_ID, 10099), "
                   "TERMINATE_PARSER); }");
  const Verdict verdict = checkFolder("");
  EXPECT_TRUE(verdict.explored.complete);
  EXPECT_EQ(verdict.explored.places, 2U);
  EXPECT_EQ(codesOf(verdict), std::set<std::string>()) << messagesOf(verdict);
}

// The end restores tags as 32-bit numbers.
TEST_F(HostileScripts, HaveWindowsWithTagsBeyond32Bits) {
  directory_.write("window.plist", "( " + buttonEntry(2) + ", " + buttonEntry(4294967299) + ", " +
                                       fieldEntry(3000000000) + " )");
  directory_.write("script.plist",
                   "{ 1 = (IDLE_LOOP); 4294967299 = (IDLE_LOOP); 2 = (TERMINATE_PARSER); }");
  const Verdict verdict = checkFolder("");
  EXPECT_TRUE(verdict.explored.complete);
  EXPECT_EQ(codesOf(verdict), std::set<std::string>{"tag-left"}) << messagesOf(verdict);
  EXPECT_EQ(verdict.findings.size(), 2U);
  for (const char* const words : {"has the tag 3,", "has the tag -1294967296,"}) {
    EXPECT_NE(messagesOf(verdict).find(words), std::string::npos) << messagesOf(verdict);
  }
}

TEST_F(HostileScripts, HaveAThousandButtonsWithoutLists) {
  std::string window = "( " + buttonEntry(2);
  for (int tag = 100; tag < 1100; ++tag) window += ",\n" + buttonEntry(tag);
  directory_.write("window.plist", window + ")");
  directory_.write("script.plist", "{ 1 = (IDLE_LOOP); 2 = (TERMINATE_PARSER); }");
  const auto began = std::chrono::steady_clock::now();
  EXPECT_EQ(checkFolder("").findings.size(), 1000U);
  EXPECT_LT(std::chrono::steady_clock::now() - began, std::chrono::seconds(10));
}

TEST_F(HostileScripts, HaveListsOfAHundredThousandElements) {
  std::string script = "{ 2 = (TERMINATE_PARSER); 1 = (";
  for (int i = 0; i < 99'999; ++i) script += "IDLE_LOOP,";
  directory_.write("script.plist", script + "IDLE_LOP); }");
  directory_.write("window.plist", "( " + buttonEntry(2) + " )");
  const Verdict verdict = checkFolder("");
  EXPECT_TRUE(verdict.explored.complete);
  ASSERT_EQ(verdict.findings.size(), 1U);
  EXPECT_EQ(verdict.findings[0].code, "unknown-command");
  EXPECT_EQ(verdict.findings[0].element, 99'999U);
}

/// Returns a script whose lists run one inside the other; the last one ends the walk-through.
std::string chainOf(int lists) {
  std::string script = "{ " + std::to_string(lists) + " = (TERMINATE_PARSER);";
  for (int tag = 1; tag < lists; ++tag) {
    script +=
        std::to_string(tag) + " = ((PROCESS_COMMANDS_FOR_ID, " + std::to_string(tag + 1) + "));\n";
  }
  return script + "}";
}

TEST_F(HostileScripts, HaveLongChainsThatEnd) {
  directory_.write("script.plist", chainOf(900));
  directory_.write("window.plist", "( " + buttonEntry(2) + " )");
  const Verdict verdict = checkFolder("");
  EXPECT_TRUE(verdict.explored.complete);
  EXPECT_EQ(codesOf(verdict), std::set<std::string>()) << messagesOf(verdict);
}

TEST_F(HostileScripts, HaveChainsThatOverflowTheStack) {
  directory_.write("script.plist", chainOf(30'000));
  directory_.write("window.plist", "( " + buttonEntry(2) + " )");
  const Verdict verdict = checkFolder("");
  EXPECT_TRUE(codesOf(verdict).contains("endless-chain")) << messagesOf(verdict);
}

TEST_F(HostileScripts, HaveNothingButNoise) {
  directory_.write(
      "script.plist",
      "{ \"\" = (); x = \"\"; 1 = (((((()))))); 2 = {}; 3 = <00ff>; 4 = ((\"\", \"\")); "
      "99999999999999999999 = ((), (x), ((x))); \"-1\" = (IDLE_LOOP, IDLE_LOOP); }");
  directory_.write("window.plist", "( " + buttonEntry(-1) + " )");
  for (const char* const key : {"1", "2", "3", "4", "-1", "x", ""}) {
    CheckOptions options;
    options.startKeys = {key};
    EXPECT_TRUE(checkFolder("", options).explored.complete) << key;
  }
}

}  // namespace
}  // namespace qz::tools::check
