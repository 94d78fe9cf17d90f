// SPDX-License-Identifier: MIT
// Runs the scenarios of tests.
#pragma once

#include <string>
#include <string_view>

#include "tools/scenario/runner.hpp"
#include "tools/scenario/scenario_files.hpp"
#include "tools/support/drivers.hpp"

namespace qz::tools::cover {

/// Runs the scenarios of the present directory until one fails, and returns why; empty if all pass.
inline std::string firstFailureOn(std::string_view toolkit) {
  const scenario::Runner runner{
      [&] { return makeDriver(std::string(toolkit)); }, std::string(toolkit),
      [](const std::string&, const scenario::Statement&, const std::string&) {}};
  const auto read = scenario::readScenarios({"."});
  if (!read.problems.empty()) return read.problems.front();
  for (const scenario::LoadedFile& file : read.files) {
    for (const scenario::Scenario& each : file.contents.scenarios) {
      const scenario::Report report = runner.run(file, each);
      if (report.verdict == scenario::Verdict::passed) continue;
      return report.file + ":" + std::to_string(report.failedLine) + ": " + report.problem;
    }
  }
  return "";
}

}  // namespace qz::tools::cover
