// SPDX-License-Identifier: MIT
// Expectations: each rule and each condition, where it holds and where it does not.

#include "tools/check/expectations.hpp"

#include <gtest/gtest.h>

#include "tests/check/checking.hpp"
#include "tests/tools/play_files.hpp"
#include "tools/check/report.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools::check {
namespace {

// Start: the text 5 says "One", and the timer 20 runs. Button 3: hides and disables box 9, and so
// on. The timer: everything as at first, and the picture disappears. Button 2: the end.
constexpr const char* fiveControls = R"((
  { class = NSTextField; tag = 5; frame = (10, 50, 190, 30); title = ""; },
  { class = "NSButton:toggle"; tag = 9; frame = (10, 90, 190, 30); title = "Box"; },
  { class = NSImageView; tag = 8; frame = (10, 130, 90, 30); image = "pic"; },
  { class = NSButton; tag = 3; frame = (110, 10, 90, 30); title = "Next"; },
  { class = NSButton; tag = 2; frame = (10, 10, 90, 30); title = "Close"; }
))";
constexpr const char* threeSteps = R"({
  1 = ((SET_TEXT_FOR_OBJECT_ID, One, 5), (SET_TIMER_FOR_ID, 5, 20));
  2 = (TERMINATE_PARSER);
  3 = ((SET_TEXT_FOR_OBJECT_ID, "Two, three", 5), (HIDE_OBJECT_WITH_ID, 9),
       (DISABLE_OBJECT_WITH_ID, 9), (SET_TITLE_FOR_OBJECT_ID, Last, 3), (SET_STATE_ON_FOR_OBJECT_ID, 9),
       (SET_TOOL_TIP_FOR_ID, Help, 3), (SET_TIMER_FOR_ID, 5, 21));
  9 = ();
  20 = (IDLE_LOOP);
  21 = ((LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID, none, 8));
  90 = (IDLE_LOOP);
})";

class Expectations : public testing::Test {
 protected:
  void SetUp() override {
    directory_.write("window.plist", fiveControls);
    directory_.write("script.plist", threeSteps);
    directory_.write("pic.png",
                     *wholeFile(std::string(QZ_SOURCE_DIR) + "/examples/first-steps/disk.png"));
  }

  Verdict check(const std::string& expectations, CheckOptions options = {}) const {
    directory_.write("check.expect", expectations);
    return checkFolder("", std::move(options));
  }

  static std::vector<Finding> failuresIn(const Verdict& verdict) {
    std::vector<Finding> failures;
    std::copy_if(verdict.findings.begin(), verdict.findings.end(), std::back_inserter(failures),
                 [](const Finding& each) { return each.code == "expectation"; });
    return failures;
  }

  /// Expects the line to hold.
  void expectToHold(const std::string& line) const {
    const Verdict verdict = check(line + "\n");
    EXPECT_EQ(verdict.expected.hold, 1U) << line << "\n" << messagesOf(verdict);
    EXPECT_EQ(verdict.expected.fail, 0U) << line;
    EXPECT_EQ(verdict.expected.open, 0U) << line;
    EXPECT_TRUE(failuresIn(verdict).empty()) << line;
  }

  /// Expects the line not to hold, and the finding to have this path.
  void expectToFail(const std::string& line, const std::string& path) const {
    const Verdict verdict = check("\n" + line + "\n");
    EXPECT_EQ(verdict.expected.fail, 1U) << line;
    EXPECT_EQ(verdict.expected.hold, 0U) << line;
    const auto failures = failuresIn(verdict);
    ASSERT_EQ(failures.size(), 1U) << line;
    EXPECT_EQ(failures[0].severity, Severity::error);
    EXPECT_EQ(playArguments(failures[0].path), path) << line;
    ASSERT_TRUE(failures[0].elsewhere) << line;
    EXPECT_EQ(failures[0].elsewhere->text(), "check.expect:2");
    EXPECT_NE(failures[0].message.find(line), std::string::npos) << failures[0].message;
  }

  /// Returns how the file is refused.
  std::string refusal(const std::string& expectations) const {
    try {
      check(expectations);
    } catch (const Failure& failure) {
      EXPECT_EQ(failure.status(), ExitStatus::badInput);
      return failure.what();
    }
    return "accepted";
  }

  play::WorkingDirectory directory_;
};

const std::string afterNext = "--start 1 --press 3";
const std::string afterPicture = "--start 1 --press 3 --advance 5";
const std::string afterEnd = "--start 1 --press 2";

TEST_F(Expectations, CanReach) {
  expectToHold("can reach list 21");
  expectToHold("can reach the end");
  expectToHold("can reach hidden 9");
  expectToFail("can reach list 90", "");
  expectToFail("can reach text 5 None", "");
}

TEST_F(Expectations, CanReachSaysHowManyPlacesItLookedThrough) {
  const Verdict verdict = check("can reach list 90");
  const std::string message = failuresIn(verdict).at(0).message;
  EXPECT_NE(message.find(std::to_string(verdict.explored.places)), std::string::npos) << message;
}

TEST_F(Expectations, AlwaysCanReach) {
  expectToHold("always can reach the end");
  expectToHold("always can reach list 3");
  expectToFail("always can reach list 20", "--start 1 --press 9");
  expectToFail("always can reach shown 9", afterNext);
}

TEST_F(Expectations, Always) {
  expectToHold("always enabled 2");
  expectToHold("always not hidden 5");
  expectToFail("always shown 9", afterNext);
  expectToFail("always timer 20", "--start 1 --press 9");
}

TEST_F(Expectations, Never) {
  expectToHold("never hidden 2");
  expectToHold("never list 90 ran");
  expectToFail("never hidden 9", afterNext);
  expectToFail("never list 21", afterPicture);
  expectToFail("never the end", afterEnd);
}

TEST_F(Expectations, Whenever) {
  expectToHold("whenever list 3 ran, disabled 9");
  expectToHold("whenever hidden 9, disabled 9");
  expectToHold("whenever list 90 ran, enabled 9");
  expectToFail("whenever list 3 ran, enabled 9", afterNext);
  expectToFail("whenever hidden 9, image 8 pic", afterPicture);
}

TEST_F(Expectations, WheneverComparesWhatTwoControlsShow) {
  expectToHold("whenever text 5 \"Two, three\", title 3 Last");
  expectToFail("whenever title 3 Last, text 5 One", afterNext);
}

TEST_F(Expectations, Within) {
  expectToHold("within 1 moves the end");
  expectToHold("within 1 move list 3");
  expectToHold("within 0 moves text 5 One");
  expectToFail("within 0 moves the end", afterEnd);
  expectToFail("within 1 moves list 21", afterPicture);
  expectToFail("within 99 moves list 90", "");
}

TEST_F(Expectations, KnowEveryCondition) {
  const struct {
    const char* before;  // holds before the press of button 3, and not after it
    const char* after;
  } cases[] = {
      {"shown 9", "hidden 9"},
      {"enabled 9", "disabled 9"},
      {"text 5 One", "text 5 \"Two, three\""},
      {"title 3 Next", "title 3 Last"},
      {"not on 9", "on 9"},
      {"tooltip 3 \"\"", "tooltip 3 Help"},
      {"timer 20", "timer 21"},
  };
  for (const auto& test : cases) {
    expectToHold("can reach " + std::string(test.before));
    expectToHold("whenever list 3 ran, " + std::string(test.after));
    expectToFail("never " + std::string(test.after), afterNext);
    expectToFail("whenever list 3 ran, " + std::string(test.before), afterNext);
  }
}

// Nothing is true of a tag that no control has at the moment.
TEST_F(Expectations, KnowTagsThatCome) {
  directory_.write(
      "script.plist",
      "{ 1 = (IDLE_LOOP); 3 = ((SET_TAG_FOR_OBJECT_ID, 7, 5)); 2 = (TERMINATE_PARSER); }");
  expectToHold("can reach shown 7");
  const Verdict verdict = check("always shown 7\n");
  ASSERT_EQ(failuresIn(verdict).size(), 1U);
  EXPECT_EQ(failuresIn(verdict)[0].path.size(), 1U) << "before the press";
}

TEST_F(Expectations, KnowAnImage) {
  expectToFail("always image 8 pic", afterPicture);
  expectToHold("whenever list 20 ran, image 8 pic");
}

TEST_F(Expectations, DoNotCountAStateThatTheUserChanged) {
  expectToFail("always off 9", "--start 1 --press 9");
  expectToFail("whenever list 9 ran, off 9", "--start 1 --press 9");
  expectToFail("whenever list 9 ran, on 9", "--start 1 --press 9");
}

TEST_F(Expectations, AreCounted) {
  const Verdict verdict = check("never hidden 2\nnever hidden 9\nnever hidden 3\n");
  EXPECT_EQ(verdict.expected.hold, 2U);
  EXPECT_EQ(verdict.expected.fail, 1U);
  EXPECT_EQ(verdict.expected.open, 0U);
}

TEST_F(Expectations, StayOpenIfNotEverythingIsExplored) {
  CheckOptions options;
  options.limits.places = 1;
  const Verdict verdict = check(
      "never hidden 9\ncan reach list 21\nalways can reach the end\nnever text 5 One\n", options);
  EXPECT_FALSE(verdict.explored.complete);
  EXPECT_EQ(verdict.expected.open, 3U);
  EXPECT_EQ(verdict.expected.fail, 1U) << "the start itself contradicts this line";
  EXPECT_EQ(playArguments(failuresIn(verdict).at(0).path), "--start 1");
}

TEST_F(Expectations, AreReadFromTheFileOfTheOption) {
  directory_.write("check.expect", "no sense");
  directory_.write("other", "never hidden 9\r\n\n  # a comment\nnever hidden 2 # and one more\n");
  CheckOptions options;
  options.expectations = "other";
  const Verdict verdict = checkFolder("", options);
  EXPECT_EQ(verdict.expected.hold, 1U);
  ASSERT_EQ(failuresIn(verdict).size(), 1U);
  EXPECT_EQ(failuresIn(verdict)[0].elsewhere->text(), "other:1");
}

TEST_F(Expectations, AreRefusedWithThePlaceAndWhatWasExpected) {
  const struct {
    const char* line;
    int column;
    const char* expected;
    const char* found;
  } cases[] = {
      {"maybe hidden 9", 1, "\"whenever\"", "“maybe”"},
      {"can list 3", 5, "\"reach\"", "“list”"},
      {"can reach", 10, "a condition", "the end of the line"},
      {"never the start", 11, "\"end\"", "“start”"},
      {"never hiden 9", 7, "did you mean \"hidden\"", "“hiden”"},
      {"never hidden nine", 14, "the tag of a control", "“nine”"},
      {"never hidden 9x", 14, "the tag of a control", "“9x”"},
      {"never hidden", 13, "the tag of a control", "the end of the line"},
      {"never text 5", 13, "what it shows", "the end of the line"},
      {"can reach list", 15, "the key of a list", "the end of the line"},
      {"within few moves the end", 8, "a number of moves", "“few”"},
      {"within -1 moves the end", 8, "a number of moves", "“-1”"},
      {"within 5 the end", 10, "\"moves\"", "“the”"},
      {"never hidden 9 10", 16, "the end of the line", "“10”"},
      {"whenever list 3 ran", 20, "a condition", "the end of the line"},
      {"can reach list 99", 16, "no list", "“99”"},
  };
  for (const auto& test : cases) {
    const std::string message = refusal("# a comment\n\n" + std::string(test.line) + "\n");
    const std::string place = "check.expect:3:" + std::to_string(test.column) + ": ";
    EXPECT_TRUE(message.starts_with(place)) << place << "\n" << message;
    EXPECT_NE(message.find(test.expected), std::string::npos) << message;
    EXPECT_NE(message.find(test.found), std::string::npos) << message;
  }
}

TEST_F(Expectations, AreRefusedWithTheColumnInCharacters) {
  const struct {
    const char* line;
    const char* place;
  } cases[] = {
      {"\tnever text 5 \"é日😀\" more", "check.expect:1:21: "},
      {"  never hidden  # a comment", "check.expect:1:15: "},
      {"never hidden  \r", "check.expect:1:13: "},
      {"never hidden 9,10", "check.expect:1:15: "},
      {"whenever hidden 9,", "check.expect:1:19: "},
  };
  for (const auto& test : cases) {
    const std::string message = refusal(std::string(test.line) + "\n");
    EXPECT_TRUE(message.starts_with(test.place)) << test.line << "\n" << message;
  }
}

TEST_F(Expectations, ThatNameATagOfNoControlAreRefused) {
  EXPECT_EQ(refusal("never hidden 77\n"), "check.expect:1:14: no control ever has the tag 77");
  EXPECT_EQ(refusal("whenever list 1 ran, not text 78 One\n"),
            "check.expect:1:31: no control ever has the tag 78");
}

TEST_F(Expectations, AreNamedAsTheFileHasThem) {
  const Verdict verdict = check("never text 5 \"Two, three\"  # a comment\n");
  const std::string message = failuresIn(verdict).at(0).message;
  EXPECT_NE(message.find("never text 5 \"Two, three\"”"), std::string::npos) << message;
}

TEST_F(Expectations, AFileThatCannotBeReadIsRefused) {
  CheckOptions options;
  options.expectations = std::string("none.expect");
  try {
    checkFolder("", options);
    FAIL() << "accepted";
  } catch (const Failure& failure) {
    EXPECT_EQ(failure.status(), ExitStatus::badInput);
    EXPECT_EQ(std::string(failure.what()).find("none.expect: "), 0U) << failure.what();
  }
}

}  // namespace
}  // namespace qz::tools::check
