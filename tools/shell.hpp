// SPDX-License-Identifier: MIT
// The tool's shell: runs a command line, and turns every error into one line and an exit status.
#pragma once

#include <string>
#include <vector>

#include "tools/command_line.hpp"

namespace qz::tools {

/// Runs the tool with the arguments that follow its name. Returns its exit status. Reports an error
/// as one line on standard error.
int runTool(const std::vector<std::string>& arguments, const std::vector<CommandEntry>& commands);

}  // namespace qz::tools
