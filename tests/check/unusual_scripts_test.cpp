// SPDX-License-Identifier: MIT
// What is said of mistakes that scripts seldom have.

#include <gtest/gtest.h>

#include <algorithm>
#include <sstream>

#include "qz/property_list/formats.hpp"
#include "qz/property_list/reader.hpp"
#include "tests/check/checking.hpp"
#include "tests/tools/play_files.hpp"
#include "tools/check/report.hpp"

namespace qz::tools::check {
namespace {

constexpr const char* windowOfSix = R"((
  { class = NSTextField; tag = 5; frame = (10, 50, 190, 30); title = ""; },
  { class = NSImageView; tag = 8; frame = (10, 130, 90, 30); },
  { class = NSButton; tag = 3; frame = (110, 10, 90, 30); title = "Next"; },
  { class = NSButton; tag = 4; frame = (210, 10, 90, 30); title = "Other"; },
  { class = NSTextField; tag = 6; frame = (10, 90, 190, 30); title = ""; },
  { class = NSButton; tag = 2; frame = (10, 10, 90, 30); title = "Close"; }
))";

/// Returns 40 words, which take 12 seconds to read.
std::string longText() {
  std::string text;
  for (int i = 0; i < 40; ++i) text += "word ";
  return "\"" + text + "\"";
}

class UnusualScripts : public testing::Test {
 protected:
  void SetUp() override { directory_.write("window.plist", windowOfSix); }

  Verdict check(const std::string& script, CheckOptions options = {}) const {
    directory_.write("script.plist", script);
    return checkFolder("", std::move(options));
  }
  static const Finding* findingWith(const Verdict& verdict, const std::string& code) {
    const auto found = std::find_if(verdict.findings.begin(), verdict.findings.end(),
                                    [&](const Finding& each) { return each.code == code; });
    return found == verdict.findings.end() ? nullptr : &*found;
  }

  play::WorkingDirectory directory_;
};

TEST_F(UnusualScripts, AreReadToTheEnd) {
  const struct {
    const char* list;
    const char* code;
    const char* message;
    const char* help;
  } cases[] = {
      {"(LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID, none, 8, 9)", "extra-parameter",
       "LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID takes at most 2 and has 3; the command then does "
       "nothing",
       "delete the parameters from this one on"},
      {"(TERMINATE_PARSER)", "unknown-command",
       "TERMINATE_PARSER is a simple command, and here it is an array; the engine does nothing "
       "here",
       "write the string TERMINATE_PARSER without an array"},
      {"SET_TEXT_FOR_OBJECT_ID", "unknown-command",
       "SET_TEXT_FOR_OBJECT_ID is a compound command, and here it is a string; the engine does "
       "nothing here",
       "write an array: the name, then its parameters"},
      {"terminate_parser", "unknown-command",
       "the name of a simple command must be written in capitals, and “terminate_parser” is not; "
       "the engine does nothing here",
       "write TERMINATE_PARSER"},
      {"{ a = b; }", "malformed-command",
       "this element is a dictionary and not a command, so the engine skips it",
       "write a string (the command's name), or an array that begins with the name"},
  };
  for (const auto& test : cases) {
    const Verdict verdict =
        check("{ 1 = (" + std::string(test.list) + "); 2 = (TERMINATE_PARSER); }");
    const Finding* const finding = findingWith(verdict, test.code);
    ASSERT_NE(finding, nullptr) << test.message << "\n" << messagesOf(verdict);
    EXPECT_EQ(finding->message, test.message);
    EXPECT_EQ(finding->help, test.help);
  }
}

TEST_F(UnusualScripts, AreStuckFromTheStart) {
  directory_.write(
      "window.plist",
      "( { class = NSTextField; tag = 5; frame = (10, 50, 190, 30); title = \"\"; } )");
  const Verdict verdict = check("{ 1 = ((SET_TEXT_FOR_OBJECT_ID, Welcome, 5)); }");
  const Finding* const finding = findingWith(verdict, "dead-end");
  ASSERT_NE(finding, nullptr) << messagesOf(verdict);
  EXPECT_EQ(finding->list, "1");
  EXPECT_EQ(finding->path.size(), 1U);
}

TEST_F(UnusualScripts, AreStuckAtAStartThatIsNotAList) {
  const Verdict verdict = check("{ 1 = Welcome; 9 = (IDLE_LOOP); }");
  const Finding* const finding = findingWith(verdict, "dead-end");
  ASSERT_NE(finding, nullptr) << messagesOf(verdict);
  EXPECT_EQ(finding->message.substr(0, 31), "the start leaves the user stuck");
  EXPECT_EQ(finding->list, std::nullopt);
}

TEST_F(UnusualScripts, AreATrapFromOneOfTheirStarts) {
  CheckOptions options;
  options.startKeys = {"1", "7"};
  const Verdict verdict = check(
      "{ 1 = (IDLE_LOOP); 7 = ((HIDE_OBJECT_WITH_ID, 2)); 2 = (TERMINATE_PARSER);"
      " 3 = ((SET_TEXT_FOR_OBJECT_ID, a, 5)); }",
      options);
  const Finding* const finding = findingWith(verdict, "trap");
  ASSERT_NE(finding, nullptr) << messagesOf(verdict);
  EXPECT_EQ(finding->list, "7");
  EXPECT_EQ(finding->path.size(), 1U);
}

TEST_F(UnusualScripts, HaveATimerThatLeadsToNoList) {
  const Verdict verdict =
      check("{ 1 = ((SET_TIMER_FOR_ID, 5, 9)); 9 = Later; 2 = (TERMINATE_PARSER); }");
  const Finding* const finding = findingWith(verdict, "not-a-list");
  ASSERT_NE(finding, nullptr) << messagesOf(verdict);
  EXPECT_TRUE(verdict.explored.complete);
  EXPECT_EQ(verdict.explored.waits, 1U);
}

// A text that one timer shows again after the other is read for as long as all of them last.
TEST_F(UnusualScripts, ShowATextAgainBeforeItIsRead) {
  const std::string text = longText();
  const Verdict verdict =
      check("{ 1 = ((SET_TEXT_FOR_OBJECT_ID, " + text + ", 5), (SET_TIMER_FOR_ID, 2, 20));" +
            " 20 = ((SET_TEXT_FOR_OBJECT_ID, " + text + ", 5), (SET_TIMER_FOR_ID, 3, 21));" +
            " 21 = ((SET_TEXT_FOR_OBJECT_ID, Bye, 5)); 2 = (TERMINATE_PARSER); }");
  const Finding* const finding = findingWith(verdict, "too-brief");
  ASSERT_NE(finding, nullptr) << messagesOf(verdict);
  EXPECT_NE(finding->message.find("after 5 s; reading it takes 12 s"), std::string::npos)
      << finding->message;
}

TEST_F(UnusualScripts, ShowATextForEver) {
  const std::string text = longText();
  const Verdict verdict =
      check("{ 1 = ((SET_TEXT_FOR_OBJECT_ID, " + text + ", 5), (SET_TIMER_FOR_ID, 2, 20));" +
            " 20 = ((SET_TEXT_FOR_OBJECT_ID, " + text + ", 5), (SET_TIMER_FOR_ID, 2, 20));" +
            " 2 = (TERMINATE_PARSER); }");
  EXPECT_EQ(findingWith(verdict, "too-brief"), nullptr) << messagesOf(verdict);
}

// Both ways lead to the brief text; the finding has the shorter one, and counts both places.
TEST_F(UnusualScripts, AreTooBriefOnTwoWays) {
  const Verdict verdict = check(
      "{ 1 = (IDLE_LOOP); 3 = ((SET_TAG_FOR_OBJECT_ID, 30, 3), (PROCESS_COMMANDS_FOR_ID, 40));"
      " 4 = ((PROCESS_COMMANDS_FOR_ID, 40)); 30 = (IDLE_LOOP);"
      " 40 = ((SET_TEXT_FOR_OBJECT_ID, " +
      longText() +
      ", 5), (SET_TIMER_FOR_ID, 2, 41));"
      " 41 = ((SET_TEXT_FOR_OBJECT_ID, Bye, 5)); 2 = (TERMINATE_PARSER); }");
  const Finding* const finding = findingWith(verdict, "too-brief");
  ASSERT_NE(finding, nullptr) << messagesOf(verdict);
  EXPECT_EQ(finding->path.size(), 3U);
  EXPECT_EQ(finding->places, 2U);
}

TEST_F(UnusualScripts, AreBinary) {
  const auto script = toolkit::dictionaryFromPropertyList(
      "{ 1 = (IDLE_LOP, TERMINATE_PARSR); 2 = (TERMINATE_PARSER); 7 = (IDLE_LOPP); }");
  directory_.write("script.plist", toolkit::formatRow(toolkit::Format::binary).write(script));
  CheckOptions options;
  options.standIn = true;
  options.toolkit = testToolkit();
  const InputFile file("script.plist", "a script");
  const Verdict verdict = checkScript(file, options, {});
  std::vector<std::size_t> offsets;
  for (const Finding& finding : verdict.findings) {
    const auto position = finding.where ? file.positionOf(finding.where) : std::nullopt;
    if (position) offsets.push_back(std::get<toolkit::BytePosition>(*position).offset);
  }
  EXPECT_GE(offsets.size(), 3U) << messagesOf(verdict);
  EXPECT_TRUE(std::is_sorted(offsets.begin(), offsets.end()));
}

// Ten switches: rounds are long enough for threads.
TEST_F(UnusualScripts, AreTheSameForAnyNumberOfThreads) {
  std::string window = "( { class = NSButton; tag = 2; frame = (0, 0, 9, 9); }";
  std::string script = "{ 1 = (IDLE_LOOP); 2 = (TERMINATE_PARSER); 7 = (IDLE_LOP);";
  for (int i = 0; i < 10; ++i) {
    const std::string off = std::to_string(1000 + i);
    const std::string on = std::to_string(2000 + i);
    window += ", { class = NSButton; tag = " + off + "; frame = (0, 0, 9, 9); }";
    script += off + " = ((SET_TAG_FOR_OBJECT_ID, " + on + ", " + off + ")); " + on +
              " = ((SET_TAG_FOR_OBJECT_ID, " + off + ", " + on + "));";
  }
  directory_.write("window.plist", window + ")");
  directory_.write("script.plist", script + "}");
  std::vector<std::string> reports;
  for (const unsigned threads : {1U, 2U, 3U}) {
    CheckOptions options;
    options.threads = threads;
    const Verdict verdict = checkFolder("", options);
    const InputFile file("script.plist", "a script");
    EXPECT_GE(verdict.explored.places, 1024U);
    std::ostringstream report;
    writeJson({.scripts = {Report{verdict, file, "", Severity::warning}}, .unchecked = {}}, false,
              report);
    reports.push_back(report.str());
  }
  EXPECT_EQ(reports[0], reports[1]);
  EXPECT_EQ(reports[0], reports[2]);
}

}  // namespace
}  // namespace qz::tools::check
