// SPDX-License-Identifier: MIT
#include "tools/cover/cover.hpp"

#include "tools/cover/scenario_text.hpp"
#include "tools/cover/tours.hpp"

namespace qz::tools::cover {
namespace {

constexpr std::size_t longestTour = 12;  // moves

/// Returns the name of a file that no other scenario has.
std::string freeName(const std::map<std::string, std::string>& files, const std::string& name) {
  std::string file = name + ".walk";
  for (int number = 2; files.contains(file); ++number) {
    file = name + "-" + std::to_string(number) + ".walk";
  }
  return file;
}

void count(const std::set<Goal>& goals, Coverage& coverage) {
  std::set<SeenStep> steps;
  for (const Goal& goal : goals) {
    if (goal.ranList != check::noList) continue;
    steps.insert(goal.to);
    ++coverage.moves;
  }
  coverage.steps = steps.size();
}

}  // namespace

Coverage coverScript(const InputFile& file, const check::CheckOptions& options,
                     const std::string& directory, const check::ExplorationHooks& hooks) {
  const check::Script script(file.dictionary());
  const auto plan = walkthrough::planStage(options.stage, script.dictionary(), file.path());
  check::Setting setting = check::settingOf(script, plan, check::resourcesFor(file, options));
  setting.wholeLooks = true;
  setting.watchedLists.assign(script.lists().size(), true);
  const auto exploration = check::explore(setting, check::startKeysOf(file, script, options),
                                          options.limits, options.threads, hooks);
  const VisitGraph graph(*exploration, options.threads);
  Coverage coverage{.isComplete = exploration->isComplete()};
  count(graph.goals(), coverage);
  const check::WrittenPlay play{setting, file.path(), directory};
  for (const check::Path& path : toursOf(*exploration, graph, longestTour)) {
    WrittenScenario scenario = scenarioOf(play, path);
    coverage.files[freeName(coverage.files, scenario.name)] = std::move(scenario.text);
  }
  return coverage;
}

}  // namespace qz::tools::cover
