// SPDX-License-Identifier: MIT
// Runs scenarios, each on its own stage.
#pragma once

#include <filesystem>
#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "qz/drivers/driver.hpp"
#include "tools/scenario/parser.hpp"

namespace qz::tools::scenario {

/// A scenario file that was read.
struct LoadedFile {
  std::string path;  ///< as the user named it
  ScenarioFile contents;
};

enum class Verdict { passed, failed, skipped };

struct Report {
  Verdict verdict = Verdict::passed;
  std::string file;
  std::string title;  ///< the file's name if the whole file is the scenario
  int line = 0;       ///< where the scenario begins
  double seconds = 0;
  // If it failed: where, why ("expected …, got …") and the statement. If it was skipped, only
  // `problem`: why.
  int failedLine = 0;
  std::string problem;
  std::string statement;
};

struct Runner {
  /// Makes the driver for one scenario.
  std::function<std::unique_ptr<drivers::Driver>()> makeDriver;
  std::string toolkit;  ///< the name of its toolkit
  /// Called after each statement that succeeded: file, statement, outcome in words.
  std::function<void(const std::string&, const Statement&, const std::string&)> performed;

  Report run(const LoadedFile& file, const Scenario& scenario) const;
};

/// Returns the scenario's title, or the file's name if the whole file is the scenario.
std::string titleOf(const LoadedFile& file, const Scenario& scenario);

}  // namespace qz::tools::scenario
