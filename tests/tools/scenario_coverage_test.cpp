// SPDX-License-Identifier: MIT
// The language is complete: every statement and every property exists, works, and can be reached.
#include <gtest/gtest.h>

#include <set>
#include <string>
#include <vector>

#include "qz/commands.hpp"
#include "scenario_support.hpp"
#include "tools/scenario/references.hpp"
#include "tools/scenario/scenario_files.hpp"

namespace qz::tools::scenario {
namespace {

std::vector<std::string> namesOf(const std::vector<PropertyInfo>& infos) {
  std::vector<std::string> names;
  names.reserve(infos.size());
  for (const auto& info : infos) names.emplace_back(info.name);
  return names;
}

TEST(ScenarioCoverage, TheEngineShowsAllOfItsFields) {
  EXPECT_EQ(namesOf(vocabulary().engine),
            (std::vector<std::string>{"flashing", "runningAsSheet", "terminating", "hasTerminated",
                                      "window", "plistDictionary", "commandArray", "objectId",
                                      "flashingTimer", "flashingTagIds", "tutorialWindow",
                                      "addedObjectToTutorial", "guiAssets", "lastTagId",
                                      "objectIdTimers", "buttonStates", "originalTagValues"}));
}

TEST(ScenarioCoverage, AllOfItsFieldsButTheButtonStatesCanBeSet) {
  for (const auto& info : vocabulary().engine) {
    EXPECT_EQ(info.written != Takes::nothing, info.name != "buttonStates") << info.name;
  }
}

TEST(ScenarioCoverage, ControlsAndWindowsShowAllThatTheyAre) {
  EXPECT_EQ(namesOf(vocabulary().control),
            (std::vector<std::string>{"class",     "tag",         "frame",  "hidden",     "enabled",
                                      "state",     "highlighted", "title",  "text",       "tooltip",
                                      "image",     "action",      "target", "background", "font",
                                      "alignment", "color",       "link",   "bold",       "italic",
                                      "underline", "runs"}));
  EXPECT_EQ(namesOf(vocabulary().window),
            (std::vector<std::string>{"visible", "key", "closes", "rect", "background", "delegate",
                                      "layerimage", "layered", "sheetof", "sheetends", "subviews",
                                      "style"}));
}

TEST(ScenarioCoverage, EveryCommandCanBeRenamed) {
  EXPECT_EQ(vocabulary().constants.size(), commandCatalogue().size());
}

/// The forms of the statements that a file used, and the properties that they named.
struct Used {
  std::set<std::size_t> forms;
  std::set<std::string> read;  // such as "window.visible"
  std::set<std::string> written;

  void add(const Statement& statement) {
    forms.insert(statement.form);
    const auto& arguments = statement.arguments;
    if (arguments.has("PROPERTY")) read.insert(property(arguments.text("PROPERTY")));
    if (arguments.has("SETTABLE")) written.insert(property(arguments.text("SETTABLE")));
  }

  static std::string property(const std::string& text) {
    static const std::set<std::string> windows = {"main", "panel", "built"};
    const auto path = splitPath(text);
    const auto kind = path.subject == "engine"         ? "engine"
                      : windows.contains(path.subject) ? "window"
                                                       : "control";
    return std::string(kind) + "." + path.property.value_or("");
  }

  /// Returns the properties that were not read, or can be set and were not set.
  std::set<std::string> missing(const std::string& kind,
                                const std::vector<PropertyInfo>& infos) const {
    std::set<std::string> missing;
    for (const auto& info : infos) {
      const auto name = kind + "." + std::string(info.name);
      if (!read.contains(name)) missing.insert("expect " + name);
      if (info.written != Takes::nothing && !written.contains(name)) missing.insert("set " + name);
    }
    return missing;
  }
};

TEST(ScenarioCoverage, AFileUsesEverythingAndPasses) {
  const auto files = readScenarios({QZ_TEST_DATA "/scenarios/everything.walk"});
  ASSERT_TRUE(files.problems.empty()) << files.problems.front();
  Used used;
  auto runner = quietRunner();
  runner.performed = [&](const std::string&, const Statement& statement, const std::string&) {
    used.add(statement);
  };
  for (const auto& scenario : files.files.at(0).contents.scenarios) {
    const auto report = runner.run(files.files[0], scenario);
    EXPECT_EQ(report.verdict, Verdict::passed)
        << report.title << ", line " << report.failedLine << ": " << report.problem;
  }
  for (std::size_t form = 0; form < vocabulary().forms.size(); ++form) {
    EXPECT_TRUE(used.forms.contains(form)) << vocabulary().forms[form].syntax;
  }
  const std::set<std::string> nothing;
  EXPECT_EQ(used.missing("engine", vocabulary().engine), nothing);
  EXPECT_EQ(used.missing("control", vocabulary().control), nothing);
  EXPECT_EQ(used.missing("window", vocabulary().window), nothing);
}

}  // namespace
}  // namespace qz::tools::scenario
