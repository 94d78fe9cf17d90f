// SPDX-License-Identifier: MIT
// Allowances: the findings that they take back, and those that nothing needs.

#include "tools/check/allowances.hpp"

#include <gtest/gtest.h>

#include "tests/check/checking.hpp"
#include "tests/tools/play_files.hpp"

namespace qz::tools::check {
namespace {

// never-runs of the lists 7 and 8, and no-list of the tags 3 and 4.
constexpr const char* fourWarnings =
    "{ 1 = (IDLE_LOOP); 2 = (TERMINATE_PARSER); 7 = (IDLE_LOOP); 8 = (IDLE_LOOP); }";
constexpr const char* threeButtons = R"((
  { class = NSButton; tag = 2; frame = (10, 10, 90, 30); title = "Close"; },
  { class = NSButton; tag = 3; frame = (110, 10, 90, 30); title = "Help"; },
  { class = NSButton; tag = 4; frame = (210, 10, 90, 30); title = "About"; }
))";

class Allowances : public testing::Test {
 protected:
  void SetUp() override {
    directory_.write("script.plist", fourWarnings);
    directory_.write("window.plist", threeButtons);
  }

  /// Returns the findings that are left, as CODE=KEY.
  static std::vector<std::string> left(const CheckOptions& options = {}) {
    std::vector<std::string> names;
    for (const Finding& finding : checkFolder("", options).findings) {
      const std::string tag = finding.tag ? std::to_string(*finding.tag) : "";
      names.push_back(finding.code + "=" + finding.list.value_or(tag));
    }
    return names;
  }

  static std::string refusal() {
    try {
      checkFolder("");
    } catch (const Failure& failure) {
      EXPECT_EQ(failure.status(), ExitStatus::badInput);
      return failure.what();
    }
    return "accepted";
  }

  play::WorkingDirectory directory_;
};

using Names = std::vector<std::string>;

TEST_F(Allowances, AreNotNeeded) {
  EXPECT_EQ(left(), (Names{"never-runs=7", "never-runs=8", "no-list=3", "no-list=4"}));
}

TEST_F(Allowances, TakeBackACode) {
  directory_.write("check.allow", "never-runs\n");
  EXPECT_EQ(left(), (Names{"no-list=3", "no-list=4"}));
}

TEST_F(Allowances, TakeBackTheFindingOfOneList) {
  directory_.write("check.allow", "never-runs=7\n");
  EXPECT_EQ(left(), (Names{"never-runs=8", "no-list=3", "no-list=4"}));
}

TEST_F(Allowances, TakeBackTheFindingOfOneTag) {
  directory_.write("check.allow", "no-list=4\n");
  EXPECT_EQ(left(), (Names{"never-runs=7", "never-runs=8", "no-list=3"}));
}

TEST_F(Allowances, HaveReasons) {
  directory_.write("check.allow",
                   "# all of them\r\n\n  never-runs   # the host starts them\nno-list\t#\n");
  EXPECT_EQ(left(), Names{});
}

TEST_F(Allowances, ComeFromOptionsToo) {
  directory_.write("check.allow", "never-runs\n");
  CheckOptions options;
  options.allowances = {parseAllowance("no-list=3", "--allow")};
  EXPECT_EQ(left(options), Names{"no-list=4"});
}

TEST_F(Allowances, ThatNothingNeedsAreReported) {
  directory_.write("check.allow", "never-runs=7\nno-list=5\ntrap\nnever-runs\nno-list\n");
  const Verdict verdict = checkFolder("");
  ASSERT_EQ(verdict.findings.size(), 2U) << messagesOf(verdict);
  const char* const places[] = {"check.allow:2", "check.allow:3"};
  for (std::size_t i = 0; i < 2; ++i) {
    EXPECT_EQ(verdict.findings[i].code, "unneeded-allowance");
    EXPECT_EQ(verdict.findings[i].severity, Severity::warning);
    ASSERT_TRUE(verdict.findings[i].elsewhere);
    EXPECT_EQ(verdict.findings[i].elsewhere->text(), places[i]);
  }
  EXPECT_NE(verdict.findings[0].message.find("no-list=5"), std::string::npos);
}

TEST_F(Allowances, MayBeNeededByWhatIsNotKnown) {
  directory_.write("check.allow", "never-runs\n");
  CheckOptions options;
  options.limits.places = 1;
  for (const std::string& name : left(options)) EXPECT_FALSE(name.starts_with("unneeded")) << name;
  directory_.write("check.allow", "never-runs\nno-list\n");
  std::filesystem::remove("window.plist");
  for (const std::string& name : left()) {
    EXPECT_FALSE(name.starts_with("unneeded")) << "without a window no button is known: " << name;
  }
}

TEST_F(Allowances, OfOptionsNeedNotBeNeeded) {
  CheckOptions options;
  options.allowances = {parseAllowance("trap", "--allow"), parseAllowance("never-runs", "--allow"),
                        parseAllowance("no-list", "--allow")};
  EXPECT_EQ(left(options), Names{});
}

TEST_F(Allowances, WithAnUnknownCodeAreRefused) {
  directory_.write("check.allow", "# one\nnever-run=7\n");
  EXPECT_EQ(refusal(),
            "check.allow:2:1: no finding has the code “never-run”; did you mean "
            "\"never-runs\"?");
}

TEST_F(Allowances, WithMoreWordsAreRefused) {
  directory_.write("check.allow", "never-runs 7\n");
  EXPECT_EQ(refusal().find("check.allow:1:12: expected one CODE or CODE=KEY"), 0U) << refusal();
}

TEST_F(Allowances, AreReadAsTheyAreWritten) {
  const auto all = parseAllowance("trap", "--allow");
  EXPECT_EQ(all.code, "trap");
  EXPECT_FALSE(all.key);
  EXPECT_EQ(parseAllowance("trap=a=b", "--allow").key, "a=b");
  EXPECT_EQ(parseAllowance("trap=", "--allow").key, "");
  EXPECT_THROW(parseAllowance("", "--allow"), Failure);
}

}  // namespace
}  // namespace qz::tools::check
