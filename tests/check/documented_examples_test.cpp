// SPDX-License-Identifier: MIT
// The page on checking has an example for each code: its script has exactly that finding, and its
// mended script has none.

#include "tests/check/documented_examples.hpp"

#include <gtest/gtest.h>

namespace qz::tools::check {
namespace {

Verdict check(const Example& example, const std::string& script) {
  const play::WorkingDirectory directory;
  writeExample(directory, example, script);
  return checkFolder(directory.path());
}

TEST(DocumentedExamples, AreThereForEveryCode) {
  std::vector<std::string> documented;
  for (const Example& example : documentedExamples()) documented.push_back(example.code);
  std::vector<std::string> known;
  for (const Code& code : codes()) known.emplace_back(code.name);
  EXPECT_EQ(documented, known);
}

class DocumentedExample : public testing::TestWithParam<Example> {};

TEST_P(DocumentedExample, HasExactlyItsFinding) {
  const Verdict verdict = check(GetParam(), GetParam().script);
  EXPECT_EQ(codesOf(verdict), GetParam().codes) << messagesOf(verdict);
  for (const Finding& finding : verdict.findings) {
    if (finding.code == GetParam().code) {
      EXPECT_EQ(nameOf(finding.severity), GetParam().severity);
    }
  }
}

TEST_P(DocumentedExample, HasNoneOnceMended) {
  const Verdict verdict = check(GetParam(), GetParam().mended);
  EXPECT_EQ(codesOf(verdict), std::set<std::string>()) << messagesOf(verdict);
}

INSTANTIATE_TEST_SUITE_P(All, DocumentedExample, testing::ValuesIn(documentedExamples()),
                         testNameOf);

}  // namespace
}  // namespace qz::tools::check
