// SPDX-License-Identifier: MIT
// Finding and reading scenario files.
#pragma once

#include <string>
#include <vector>

#include "tools/scenario/runner.hpp"

namespace tools::scenario {

struct ReadFiles {
  std::vector<LoadedFile> files;
  std::vector<std::string> problems;  ///< one line for each file that is no scenario
};

/// Reads the files; of a directory, every .walk file in and below it, by name. A path that is
/// nothing, or a directory without scenarios, is a problem too. A file that is named twice is read
/// once.
ReadFiles readScenarios(const std::vector<std::string>& paths);

}  // namespace tools::scenario
