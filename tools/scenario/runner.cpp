// SPDX-License-Identifier: MIT
// Runs scenarios.

#include "tools/scenario/runner.hpp"

#include <algorithm>
#include <chrono>

#include "tools/scenario/stage.hpp"
#include "tools/support/suggestions.hpp"

namespace qz::tools::scenario {
namespace {

void perform(Stage& stage, const LoadedFile& file, const Scenario& scenario) {
  for (const auto& statement : file.contents.common) stage.perform(statement);
  for (const auto& statement : scenario.statements) stage.perform(statement);
  stage.requireNothingLeft(scenario.statements.back());
}

bool isFor(const Scenario& scenario, const std::string& toolkit) {
  const auto& only = scenario.only;
  return only.empty() || std::find(only.begin(), only.end(), toolkit) != only.end();
}

}  // namespace

std::string titleOf(const LoadedFile& file, const Scenario& scenario) {
  return scenario.title.empty() ? std::filesystem::path(file.path).filename().string()
                                : scenario.title;
}

Report Runner::run(const LoadedFile& file, const Scenario& scenario) const {
  Report report;
  report.file = file.path;
  report.title = titleOf(file, scenario);
  report.line = scenario.line;
  if (!isFor(scenario, toolkit)) {
    report.verdict = Verdict::skipped;
    report.problem = "only for " + enumerate(scenario.only);
    return report;
  }
  const auto start = std::chrono::steady_clock::now();
  const auto driver = makeDriver();
  try {
    Stage stage(*driver, file.path, [&](const Statement& statement, const std::string& outcome) {
      performed(file.path, statement, outcome);
    });
    perform(stage, file, scenario);
  } catch (const Failed& failed) {
    report.verdict = Verdict::failed;
    report.failedLine = failed.statement->at.line;
    report.problem = failed.problem;
    report.statement = failed.statement->source;
  }
  report.seconds = std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
  return report;
}

}  // namespace qz::tools::scenario
