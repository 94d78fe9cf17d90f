// SPDX-License-Identifier: MIT
// The tool's shell: runs a command line, and turns whatever goes wrong into one line and an exit
// status.
#pragma once

#include <string>
#include <vector>

#include "tools/command_line.hpp"

namespace tools {

/// Runs the tool with the arguments behind its name. Gives its exit status. What goes wrong is one
/// line on standard error.
int runTool(const std::vector<std::string>& arguments, const std::vector<CommandEntry>& commands);

}  // namespace tools
