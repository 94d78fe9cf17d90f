// SPDX-License-Identifier: MIT
// Runs scenarios from text, for the tests of the scenario language.
#pragma once

#include <string>
#include <utility>
#include <vector>

#include "tools/scenario/parser.hpp"
#include "tools/scenario/runner.hpp"
#include "tools/scenario/statements.hpp"
#include "tools/support/drivers.hpp"

namespace qz::tools::scenario {

/// Returns "LINE:COLUMN: problem", or an empty text when `text` is a valid scenario file.
inline std::string refusal(const std::string& text) {
  try {
    parseScenarios(text, vocabulary());
  } catch (const SyntaxError& error) {
    return std::to_string(error.at().line) + ":" + std::to_string(error.at().column) + ": " +
           error.what();
  }
  return "";
}

/// Returns a runner on memory toolkits that does not report what it performs.
inline Runner quietRunner() {
  return {[] { return makeDriver(testToolkit()); }, testToolkit(),
          [](const std::string&, const Statement&, const std::string&) {}};
}

inline std::vector<Report> runAll(const std::string& text, const Runner& runner = quietRunner()) {
  const LoadedFile file{"test.walk", parseScenarios(text, vocabulary())};
  std::vector<Report> reports;
  for (const auto& scenario : file.contents.scenarios) {
    reports.push_back(runner.run(file, scenario));
  }
  return reports;
}

/// Returns "LINE: problem" for a text of one scenario, or an empty text when it passes.
inline std::string failure(const std::string& text) {
  const auto report = runAll(text).at(0);
  if (report.verdict != Verdict::failed) return "";
  return std::to_string(report.failedLine) + ": " + report.problem;
}

}  // namespace qz::tools::scenario
