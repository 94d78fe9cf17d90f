// SPDX-License-Identifier: MIT
// Baselines: known findings are taken back, new ones are not.

#include "tools/check/baseline.hpp"

#include <gtest/gtest.h>

#include <filesystem>

#include "tests/tools/play_files.hpp"
#include "tools/support/failure.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools::check {
namespace {

Finding findingIn(const std::string& list, const std::string& message = "a message") {
  Finding finding = findingOf("never-runs", message);
  finding.list = list;
  return finding;
}

Finding findingAt(toolkit::Tag tag) {
  Finding finding = findingOf("no-list", "a message");
  finding.tag = tag;
  return finding;
}

class Baselines : public testing::Test {
 protected:
  /// Writes a baseline with the findings of intro.plist.
  static void writeBaseline(const std::vector<Finding>& findings,
                            const std::string& path = "known") {
    auto baseline = Baseline::empty(path);
    baseline.replace("intro.plist", findings);
    baseline.write();
  }

  /// Returns how the file is refused.
  static std::string refusal(const std::string& path) {
    try {
      Baseline::read(path);
    } catch (const Failure& failure) {
      EXPECT_EQ(failure.status(), ExitStatus::badInput);
      return failure.what();
    }
    return "accepted";
  }

  play::WorkingDirectory directory_;
};

TEST_F(Baselines, TakeBackWhatTheyHave) {
  writeBaseline({findingIn("1"), findingAt(4)});
  std::vector<Finding> findings{findingIn("1"), findingIn("2"), findingAt(4), findingAt(5)};
  EXPECT_EQ(Baseline::read("known").takeBack("intro.plist", findings), 2U);
  ASSERT_EQ(findings.size(), 2U);
  EXPECT_EQ(findings[0].list, "2");
  EXPECT_EQ(findings[1].tag, 5);
}

TEST_F(Baselines, DoNotLookAtThePlaceAndTheWords) {
  Finding known = findingIn("1", "before");
  known.element = 3;
  writeBaseline({known});
  Finding moved = findingIn("1", "after");
  moved.element = 5;
  moved.path = {StartMove{"1"}};
  std::vector<Finding> findings{moved};
  EXPECT_EQ(Baseline::read("known").takeBack("intro.plist", findings), 1U);
}

TEST_F(Baselines, TellTheCodesApart) {
  writeBaseline({findingIn("1")});
  Finding other = findingOf("dead-end", "a message");
  other.list = "1";
  std::vector<Finding> findings{other};
  EXPECT_EQ(Baseline::read("known").takeBack("intro.plist", findings), 0U);
}

TEST_F(Baselines, TellTheExpectationsApart) {
  Finding known = findingOf("expectation", "a message");
  known.expectation = "never hidden 2";
  writeBaseline({known});
  Finding other = known;
  other.expectation = "never hidden 3";
  std::vector<Finding> findings{other, known};
  EXPECT_EQ(Baseline::read("known").takeBack("intro.plist", findings), 1U);
  ASSERT_EQ(findings.size(), 1U);
  EXPECT_EQ(findings[0].expectation, "never hidden 3");
}

TEST_F(Baselines, CountFindingsThatAreAlike) {
  writeBaseline({findingIn("1"), findingIn("1")});
  std::vector<Finding> findings{findingIn("1"), findingIn("1"), findingIn("1")};
  EXPECT_EQ(Baseline::read("known").takeBack("intro.plist", findings), 2U);
  EXPECT_EQ(findings.size(), 1U);
}

TEST_F(Baselines, TellTheScriptsApart) {
  writeBaseline({findingIn("1")});
  std::vector<Finding> findings{findingIn("1")};
  EXPECT_EQ(Baseline::read("known").takeBack("other.plist", findings), 0U);
  EXPECT_EQ(findings.size(), 1U);
}

TEST_F(Baselines, NameScriptsFromTheirFolder) {
  std::filesystem::create_directory("ci");
  writeBaseline({findingIn("1")}, "ci/known");
  std::vector<Finding> findings{findingIn("1")};
  EXPECT_EQ(Baseline::read("ci/known").takeBack("intro.plist", findings), 1U);
  EXPECT_NE(wholeFile("ci/known")->find("\"../intro.plist\""), std::string::npos);
}

TEST_F(Baselines, KnowAScriptByEveryPathToIt) {
  std::filesystem::create_directory("ci");
  writeBaseline({findingIn("1")}, "ci/../ci/known");
  for (const char* const path : {"intro.plist", "./intro.plist", "ci/../intro.plist"}) {
    std::vector<Finding> findings{findingIn("1")};
    EXPECT_EQ(Baseline::read("ci/known").takeBack(path, findings), 1U) << path;
  }
}

TEST_F(Baselines, AreReplacedScriptByScript) {
  writeBaseline({findingIn("1"), findingIn("2")});
  auto baseline = Baseline::read("known");
  baseline.replace("other.plist", {findingIn("7")});
  baseline.replace("intro.plist", {findingIn("2")});
  baseline.write();
  std::vector<Finding> findings{findingIn("1"), findingIn("2")};
  EXPECT_EQ(Baseline::read("known").takeBack("intro.plist", findings), 1U);
  EXPECT_EQ(findings.at(0).list, "1") << "a finding that was mended is forgotten";
  std::vector<Finding> others{findingIn("7")};
  EXPECT_EQ(Baseline::read("known").takeBack("other.plist", others), 1U);
}

TEST_F(Baselines, ForgetAScriptWithoutFindings) {
  writeBaseline({findingIn("1")});
  auto baseline = Baseline::read("known");
  baseline.replace("intro.plist", {});
  baseline.write();
  EXPECT_EQ(wholeFile("known")->find("intro.plist"), std::string::npos);
}

TEST_F(Baselines, AreTheSameBytesEachTime) {
  writeBaseline({findingAt(4), findingIn("2"), findingIn("1")});
  const auto first = *wholeFile("known");
  writeBaseline({findingIn("1"), findingIn("2"), findingAt(4)});
  EXPECT_EQ(*wholeFile("known"), first);
}

TEST_F(Baselines, SurviveEveryCharacter) {
  const std::string odd = "a\"b\\\n\x1b é 😀";
  writeBaseline({findingIn(odd, odd)});
  std::vector<Finding> findings{findingIn(odd)};
  EXPECT_EQ(Baseline::read("known").takeBack("intro.plist", findings), 1U);
}

TEST_F(Baselines, ThatAreBrokenAreRefused) {
  const char* const broken[] = {
      "",
      "{",
      "[]",
      "{}",
      "{\"version\": 2, \"scripts\": {}}",
      "{\"version\": 1}",
      "{\"version\": 1, \"scripts\": {\"a\": [{\"list\": \"1\"}]}}",
      "{\"version\": 1, \"scripts\": {\"a\": [{\"code\": 5}]}}",
      "{\"version\": 1, \"scripts\": {\"a\": [{\"code\": \"trap\", \"count\": \"x\"}]}}",
      "{\"version\": 1, \"scripts\": {}} and more",
  };
  for (const char* const text : broken) {
    directory_.write("known", text);
    EXPECT_EQ(refusal("known").find("known: expected a baseline"), 0U) << text << "\n"
                                                                       << refusal("known");
  }
}

TEST_F(Baselines, ThatAreNotThereAreRefused) {
  EXPECT_EQ(refusal("none").find("none: "), 0U) << refusal("none");
}

TEST_F(Baselines, ThatAreDirectoriesAreRefused) {
  std::filesystem::create_directory("folder");
  EXPECT_EQ(refusal("folder"), "folder: a directory; expected a baseline");
}

TEST_F(Baselines, ThatCannotBeWrittenFail) {
  EXPECT_THROW(writeBaseline({findingIn("1")}, "no such folder/known"), Failure);
}

}  // namespace
}  // namespace qz::tools::check
