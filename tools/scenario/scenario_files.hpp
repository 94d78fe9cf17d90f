// SPDX-License-Identifier: MIT
// Finds and reads scenario files.
#pragma once

#include <string>
#include <vector>

#include "tools/scenario/runner.hpp"

namespace qz::tools::scenario {

struct ReadFiles {
  std::vector<LoadedFile> files;
  std::vector<std::string> problems;  ///< one line for each path or file with an error
};

/// Reads the files; for a directory, every .walk file in and below it, sorted by path. A path that
/// does not exist, or a directory without scenarios, is a problem too. A file that is named twice
/// is read once.
ReadFiles readScenarios(const std::vector<std::string>& paths);

}  // namespace qz::tools::scenario
