// SPDX-License-Identifier: MIT
// The sources on the page about steps: each is built, and the check finds nothing wrong with it.

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <sstream>

#include "tests/check/checking.hpp"
#include "tests/tools/play_files.hpp"
#include "tools/steps/script_file.hpp"

namespace qz::tools::steps {
namespace {

/// Returns what is between the lines "```KIND" and "```" on the page.
std::vector<std::string> blocksOf(const std::string& kind) {
  std::ifstream page(std::filesystem::path(QZ_SOURCE_DIR) / "docs/steps.md");
  std::vector<std::string> blocks;
  std::string line;
  while (std::getline(page, line)) {
    if (line != "```" + kind) continue;
    std::string block;
    while (std::getline(page, line) && line != "```") block += line + '\n';
    blocks.push_back(block);
  }
  return blocks;
}

std::string windowOfRecipes() {
  for (const std::string& block : blocksOf("")) {
    if (block.starts_with("// recipes.plist\n")) return block;
  }
  return {};
}

TEST(DocumentedSources, OfRecipesHaveNoMistakes) {
  const play::WorkingDirectory folder;
  folder.write("recipes.plist", windowOfRecipes());
  std::size_t recipes = 0;
  for (const std::string& block : blocksOf("yaml")) {
    if (!block.starts_with("window: recipes.plist")) continue;
    ++recipes;
    folder.write("recipe.yaml", block);
    const ScriptFile script = openScript("recipe.yaml");
    check::CheckOptions options;
    options.toolkit = testToolkit();
    options.stage = script.stage({});
    const check::Verdict verdict = checkScript(script.file, options, {});
    EXPECT_TRUE(verdict.explored.complete);
    for (const check::Finding& finding : verdict.findings) {
      EXPECT_EQ(finding.code, "left-behind") << finding.message << "\nin\n" << block;
    }
  }
  EXPECT_EQ(recipes, 4U);
}

}  // namespace
}  // namespace qz::tools::steps
