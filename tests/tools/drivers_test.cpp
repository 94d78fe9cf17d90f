// SPDX-License-Identifier: MIT
// The table of toolkits: what scenarios, options and defaults take from it.
#include "tools/support/drivers.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <set>
#include <string>
#include <string_view>

#include "scenario_support.hpp"
#include "tools/support/failure.hpp"
#include "tools/support/suggestions.hpp"

namespace qz::tools {
namespace {

bool isIn(const std::vector<std::string_view>& names, std::string_view name) {
  return std::find(names.begin(), names.end(), name) != names.end();
}

std::string reasonWithout(std::string_view toolkit) {
  try {
    requireDriver(toolkit);
  } catch (const Failure& failure) {
    return failure.what();
  }
  return "";
}

TEST(Toolkits, EveryDriverOfTheSourcesHasARow) {
  int drivers = 0;
  for (const auto& entry : std::filesystem::directory_iterator(QZ_SOURCE_DIR "/drivers")) {
    if (!entry.is_directory()) continue;
    ++drivers;
    EXPECT_TRUE(isIn(toolkitNames(), entry.path().filename().string())) << entry.path();
  }
  EXPECT_GE(drivers, 2);
}

TEST(Toolkits, ThePageHasARowForEachDriverOfTheSources) {
  std::ifstream file(QZ_SOURCE_DIR "/docs/toolkits.md");
  const std::string page{std::istreambuf_iterator<char>(file), {}};
  for (const auto& entry : std::filesystem::directory_iterator(QZ_SOURCE_DIR "/drivers")) {
    const std::string name = entry.path().filename().string();
    if (!std::filesystem::exists(entry.path() / "CMakeLists.txt")) continue;
    EXPECT_NE(page.find("\n| `" + name + "` | "), std::string::npos) << name;
  }
}

TEST(Toolkits, EveryRowHasItsOwnNameAndPlaceAndADescription) {
  std::set<std::string_view> names;
  std::set<int> places;
  for (const ToolkitRow& row : toolkits()) {
    EXPECT_TRUE(names.insert(row.name).second) << row.name;
    EXPECT_TRUE(places.insert(row.place).second) << row.name;
    EXPECT_NE(row.description, "") << row.name;
  }
}

TEST(Toolkits, AreListedInTheOrderOfTheirPlaces) {
  const auto rows = toolkits();
  EXPECT_TRUE(
      std::is_sorted(rows.begin(), rows.end(),
                     [](const ToolkitRow& a, const ToolkitRow& b) { return a.place < b.place; }));
  EXPECT_EQ(rows.front().name, "memory");
}

TEST(Toolkits, ScenariosAcceptEveryNameAndNoOther) {
  for (const ToolkitRow& row : toolkits()) {
    EXPECT_EQ(scenario::refusal("only " + std::string(row.name) + "\nengine\n"), "") << row.name;
  }
  const auto names = toolkitNames();
  const std::string expected = enumerate({names.begin(), names.end()});
  const std::string refusal = scenario::refusal("only nosuch\nengine\n");
  EXPECT_NE(refusal.find("expected " + expected), std::string::npos) << refusal;
}

TEST(Toolkits, ABuildHasThoseThatItCanMake) {
  for (const ToolkitRow& row : toolkits()) {
    EXPECT_EQ(isIn(driverNames(), row.name), row.make != nullptr) << row.name;
    if (row.make) continue;
    EXPECT_EQ(makeDriver(row.name), nullptr);
    const std::string reason = reasonWithout(row.name);
    EXPECT_EQ(reason, "this build does not include the toolkit " + std::string(row.name) + ": " +
                          std::string(row.howToGet));
  }
}

TEST(Toolkits, TheDefaultForTestsNeedsNoDisplay) {
  const auto driver = makeDriver(testToolkit());
  ASSERT_NE(driver, nullptr);
  EXPECT_EQ(driver->name(), testToolkit());
  EXPECT_FALSE(driver->draws());
}

TEST(Toolkits, TheDefaultForPlayingHasADisplayIfOneIsThere) {
  const auto rows = toolkits();
  const auto shows = [](const ToolkitRow& row) { return row.make && row.hasDisplay; };
  const auto first = std::find_if(rows.begin(), rows.end(), shows);
  EXPECT_EQ(playerToolkit(), first == rows.end() ? testToolkit() : first->name);
}

TEST(Toolkits, TheHelpListsThoseOfThisBuild) {
  const std::string help = toolkitHelp();
  for (const ToolkitRow& row : toolkits()) {
    const std::string entry = std::string(row.name) + " (" + std::string(row.description) + ")";
    EXPECT_EQ(help.find(entry) != std::string::npos, row.make != nullptr) << help;
  }
}

}  // namespace
}  // namespace qz::tools
