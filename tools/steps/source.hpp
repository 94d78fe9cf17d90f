// SPDX-License-Identifier: MIT
// The source of a walk-through: a YAML file.
#pragma once

#include <string>

#include "tools/steps/tour.hpp"
#include "tools/walkthrough/stage.hpp"

namespace qz::tools::steps {

struct Source {
  std::string path{};
  std::string text{};
  walkthrough::StageOptions stage{};  ///< the window that the source names
  Tour tour{};
};

/// Whether the file's name is that of a source: it ends with .yaml or .yml.
bool isSourcePath(const std::string& path);

/// Reads a source, and the window that it names. Throws a SourceRefused if there are mistakes in
/// it, another Failure if a file cannot be read.
Source readSource(const std::string& path);

}  // namespace qz::tools::steps
