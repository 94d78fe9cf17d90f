// SPDX-License-Identifier: MIT
// Checks scripts: what `qz-walkthrough check` does once its command line is read.
#pragma once

#include <functional>
#include <iosfwd>
#include <optional>
#include <string>
#include <vector>

#include "tools/check/allowances.hpp"
#include "tools/check/exploration.hpp"
#include "tools/check/finding.hpp"
#include "tools/support/input_file.hpp"
#include "tools/walkthrough/stage.hpp"

namespace qz::tools::check {

struct CheckOptions {
  walkthrough::StageOptions stage;       ///< the window that the script is played in
  bool standIn = false;                  ///< play it in a window made from the script itself
  std::vector<std::string> startKeys;    ///< empty: the smallest tag
  std::optional<std::string> resources;  ///< directory of named images; absent: the script's own
  std::string toolkit;                   ///< whose fonts and images the script may use
  ExplorationLimits limits;
  double wordsPerMinute = 200;
  unsigned threads = 1;
  std::vector<Allowance> allowances;  ///< in addition to the file `check.allow` beside the script
};

/// What was explored, and whether that is everything.
struct Explored {
  std::size_t places = 0;
  std::size_t presses = 0;
  std::size_t waits = 0;
  bool complete = false;
};

/// What a check has to say of one script.
struct Verdict {
  std::string path;  ///< of the script
  Explored explored{};
  bool isStandIn = false;           ///< nothing is said about targets
  std::vector<Finding> findings{};  ///< by place in the file, most severe first
};

/// Called while a check works.
struct CheckHooks {
  std::function<void(const Progress&)> report = [](const Progress&) {};
  std::function<bool()> isCancelled = [] { return false; };
};

/// Checks one script. Throws a Failure if a file does not hold what it should.
Verdict checkScript(const InputFile& file, const CheckOptions& options, const CheckHooks& hooks);

}  // namespace qz::tools::check
