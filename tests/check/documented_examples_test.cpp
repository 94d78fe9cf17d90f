// SPDX-License-Identifier: MIT
// The page on checking has an example for each code: its script has exactly that finding, and its
// mended script has none.

#include <gtest/gtest.h>

#include <algorithm>
#include <sstream>

#include "tests/check/checking.hpp"
#include "tests/tools/play_files.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools::check {
namespace {

/// The entry of one code in the page.
struct Example {
  std::string code;
  std::set<std::string> codes;  ///< with those that cannot be avoided
  std::string severity{};
  std::string script{};
  std::string mended{};
  std::string window{};
};

std::string afterWord(const std::string& line, const std::string& word) {
  return line.starts_with(word) ? line.substr(word.size()) : "";
}

std::string* blockOf(Example& example, const std::string& mark) {
  if (mark == "plist") return &example.script;
  if (mark == "plist mended") return &example.mended;
  return mark == "plist window" ? &example.window : nullptr;
}

std::vector<Example> examples() {
  std::istringstream page(*wholeFile(std::string(QZ_SOURCE_DIR) + "/docs/checking.md"));
  std::vector<Example> found;
  std::string* block = nullptr;
  bool isInBlock = false;
  for (std::string line; std::getline(page, line);) {
    if (line.starts_with("```")) {
      isInBlock = !isInBlock;
      block = isInBlock && !found.empty() ? blockOf(found.back(), line.substr(3)) : nullptr;
    } else if (isInBlock) {
      if (block) *block += line + '\n';
    } else if (const auto heading = afterWord(line, "### `"); !heading.empty()) {
      const std::string code = heading.substr(0, heading.find('`'));
      found.push_back({.code = code, .codes = {code}});
    } else if (const auto severity = afterWord(line, "Severity: "); !severity.empty()) {
      found.back().severity = severity.substr(0, severity.find_first_of(".,;"));
    } else if (const auto with = afterWord(line, "Comes with: [`"); !with.empty()) {
      found.back().codes.insert(with.substr(0, with.find('`')));
    }
  }
  return found;
}

Verdict check(const Example& example, const std::string& script) {
  const play::WorkingDirectory directory;
  directory.write("script.plist", script);
  if (!example.window.empty()) directory.write("window.plist", example.window);
  return checkFolder(directory.path());
}

TEST(DocumentedExamples, AreThereForEveryCode) {
  std::vector<std::string> documented;
  for (const Example& example : examples()) documented.push_back(example.code);
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

/// Those of scripts alone; expectations and allowances need files of their own.
std::vector<Example> examplesOfScripts() {
  auto all = examples();
  std::erase_if(all, [](const Example& example) {
    return example.code == "expectation" || example.code == "unneeded-allowance";
  });
  return all;
}

INSTANTIATE_TEST_SUITE_P(All, DocumentedExample, testing::ValuesIn(examplesOfScripts()),
                         [](const auto& each) {
                           std::string name = each.param.code;
                           std::replace(name.begin(), name.end(), '-', '_');
                           return name;
                         });

}  // namespace
}  // namespace qz::tools::check
