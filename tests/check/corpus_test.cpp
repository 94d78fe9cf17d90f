// SPDX-License-Identifier: MIT
// Correct scripts that use the language widely: a check must not report them.

#include <gtest/gtest.h>

#include <algorithm>

#include "tests/check/checking.hpp"

namespace qz::tools::check {
namespace {

std::vector<std::filesystem::path> correctScripts() {
  std::vector<std::filesystem::path> folders;
  for (const auto& entry :
       std::filesystem::directory_iterator(std::string(QZ_SOURCE_DIR) + "/tests/check/corpus")) {
    if (entry.is_directory()) folders.push_back(entry.path());
  }
  std::sort(folders.begin(), folders.end());
  return folders;
}

class Corpus : public testing::TestWithParam<std::filesystem::path> {};

TEST_P(Corpus, HasNothingThatACheckReports) {
  const Verdict verdict = checkFolder(GetParam());
  std::set<std::string> codes = codesOf(verdict, Severity::warning);
  codes.erase("useless-delay");  // allowed: the command has no other use
  EXPECT_TRUE(verdict.explored.complete);
  EXPECT_EQ(codes, std::set<std::string>()) << messagesOf(verdict);
}

INSTANTIATE_TEST_SUITE_P(All, Corpus, testing::ValuesIn(correctScripts()), [](const auto& each) {
  std::string name = each.param.filename().string();
  std::replace(name.begin(), name.end(), '-', '_');
  return name;
});

}  // namespace
}  // namespace qz::tools::check
