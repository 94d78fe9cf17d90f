// SPDX-License-Identifier: MIT
// The list of the tool's commands: every command of the sources is in it, and in the tool's page.
#include "tools/commands.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>

#include "tool_run.hpp"

namespace qz::tools {
namespace {

bool isListed(const std::string& name) {
  const auto all = allCommands();
  return std::any_of(all.begin(), all.end(), [&](const auto& one) { return one.name == name; });
}

TEST(Commands, EveryCommandOfTheSourcesIsListed) {
  const std::string ending = "_command.cpp";
  std::size_t found = 0;
  for (const auto& entry : std::filesystem::directory_iterator(QZ_SOURCE_DIR "/tools")) {
    const std::string file = entry.path().filename().string();
    if (!file.ends_with(ending)) continue;
    ++found;
    EXPECT_TRUE(isListed(file.substr(0, file.size() - ending.size())))
        << file << " needs a row in tools/commands.inc";
  }
  EXPECT_EQ(found, allCommands().size());
}

TEST(Commands, ThePageHasARowAndASectionForEach) {
  std::ifstream file(QZ_SOURCE_DIR "/docs/qz-walkthrough.md");
  const std::string page{std::istreambuf_iterator<char>(file), {}};
  for (const CommandEntry& command : allCommands()) {
    const std::string name = command.name;
    const std::string row = "\n| [`" + name + "`](#" + name + ") | ";
    EXPECT_NE(page.find(row), std::string::npos) << "expected a row that begins with " << row;
    EXPECT_NE(page.find("\n## " + name + "\n"), std::string::npos) << "expected ## " << name;
  }
}

TEST(Commands, TheHelpListsThemInTheirOrder) {
  const Captured out(std::cout);
  EXPECT_EQ(runTool({"--help"}, allCommands()), 0);
  std::size_t at = 0;
  for (const CommandEntry& command : allCommands()) {
    at = out.text().find("\n  " + std::string(command.name) + " ", at);
    ASSERT_NE(at, std::string::npos) << command.name;
  }
}

}  // namespace
}  // namespace qz::tools
