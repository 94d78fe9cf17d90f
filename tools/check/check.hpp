// SPDX-License-Identifier: MIT
// Checks scripts: what `qz-walkthrough check` does once its command line is read.
#pragma once

#include <functional>
#include <iosfwd>
#include <optional>
#include <string>
#include <vector>

#include "tools/check/allowances.hpp"
#include "tools/check/expectation_check.hpp"
#include "tools/check/finding.hpp"
#include "tools/exploration/exploration.hpp"
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
  std::optional<std::string> expectations;  ///< path; absent: `check.expect` beside the script
};

/// What was explored, and whether that is everything.
struct Explored {
  std::size_t places = 0;
  std::size_t presses = 0;
  std::size_t waits = 0;
  bool complete = false;
  Stop stop = Stop::none;    ///< why it is not everything
  std::size_t frontier = 0;  ///< how many places are known whose moves were not made
};

/// What a check has to say of one script.
struct Verdict {
  std::string path;  ///< of the script
  Explored explored{};
  bool isStandIn = false;      ///< nothing is said about targets
  walkthrough::Names names{};  ///< of the script's source
  ExpectationCounts expected{};
  std::size_t inBaseline = 0;       ///< findings that a baseline took back
  std::vector<Finding> findings{};  ///< by place in the file, most severe first
};

/// Returns the directory of the named images.
std::string resourcesFor(const InputFile& file, const CheckOptions& options);

/// Returns the keys of the lists with which the walk-through may start. Throws a Failure if one of
/// the options is not a key of a list.
std::vector<std::string> startKeysOf(const InputFile& file, const Script& script,
                                     const CheckOptions& options);

/// Checks one script. Throws a Failure if a file does not hold what it should.
Verdict checkScript(const InputFile& file, const CheckOptions& options,
                    const ExplorationHooks& hooks);

}  // namespace qz::tools::check
