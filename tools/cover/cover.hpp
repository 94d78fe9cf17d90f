// SPDX-License-Identifier: MIT
// Scenarios that between them do all that a user can do with a script.
#pragma once

#include <map>
#include <string>

#include "tools/check/check.hpp"

namespace qz::tools::cover {

/// The scenarios of one script: their texts, by the names of their files.
struct Coverage {
  std::map<std::string, std::string> files{};
  std::size_t steps = 0;
  std::size_t moves = 0;  ///< between steps
  bool isComplete = false;
};

/// Explores a script and writes its scenarios, which will be in `directory`. Throws a Failure if a
/// file does not hold what it should.
Coverage coverScript(const InputFile& file, const check::CheckOptions& options,
                     const std::string& directory, const check::ExplorationHooks& hooks);

}  // namespace qz::tools::cover
