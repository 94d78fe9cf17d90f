// SPDX-License-Identifier: MIT
// The page for authors of scenarios: its examples pass, and it leaves nothing out.
#include <gtest/gtest.h>

#include <fstream>
#include <sstream>
#include <string>
#include <vector>

#include "qz/drivers/view_kinds.hpp"
#include "scenario_support.hpp"

namespace qz::tools::scenario {
namespace {

std::string page() {
  std::stringstream text;
  text << std::ifstream(QZ_SOURCE_DIR "/docs/scenarios.md").rdbuf();
  return text.str();
}

/// Returns the examples, which are the blocks marked "walk".
std::vector<std::string> examples() {
  const auto text = page();
  const std::string opening = "```walk\n";
  std::vector<std::string> examples;
  for (auto at = text.find(opening); at != std::string::npos; at = text.find(opening, at)) {
    at += opening.size();
    examples.push_back(text.substr(at, text.find("```", at) - at));
  }
  return examples;
}

TEST(ScenarioPage, ItsExamplesPass) {
  EXPECT_GE(examples().size(), 5U);
  for (const auto& example : examples()) {
    for (const auto& report : runAll(example)) {
      EXPECT_NE(report.verdict, Verdict::failed)
          << example << "\nline " << report.failedLine << ": " << report.problem;
    }
  }
}

TEST(ScenarioPage, ItNamesEveryStatementPropertyAndClass) {
  const auto text = page();
  const auto names = [&](const std::string& what) {
    return text.find('`' + what) != std::string::npos;
  };
  for (const auto& form : vocabulary().forms) {
    const auto keyword = std::string(form.syntax.substr(0, form.syntax.find(' ')));
    EXPECT_TRUE(names(keyword)) << form.syntax;
  }
  for (const auto* infos : {&vocabulary().engine, &vocabulary().control, &vocabulary().window}) {
    for (const auto& info : *infos) EXPECT_TRUE(names(std::string(info.name) + '`')) << info.name;
  }
  for (const auto name : drivers::viewKindNames()) {
    EXPECT_TRUE(names(std::string(name) + '`')) << name;
  }
}

}  // namespace
}  // namespace qz::tools::scenario
