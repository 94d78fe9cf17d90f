// SPDX-License-Identifier: MIT
// The scripts with which shells complete the tool's command line.
#pragma once

#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "tools/command_line.hpp"

namespace qz::tools {

/// A shell, and how its script is made.
struct CompletionShell {
  std::string_view name;
  std::string (*script)(const std::vector<CommandOutline>& commands);
};

/// Returns all shells that have a script.
std::span<const CompletionShell> completionShells();

}  // namespace qz::tools
