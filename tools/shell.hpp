// The tool's shell: reads the command line, runs the command, and turns whatever goes wrong into
// one line and an exit status.
#pragma once

#include <string>
#include <vector>

#include "tools/failure.hpp"

namespace CLI {
class App;
}

namespace tools {

/// Adds a command to the tool. The command writes the tool's exit status to `status`, or throws a
/// Failure.
using AddCommand = void (*)(CLI::App& app, int& status);

/// Runs the tool with the arguments behind its name. Gives its exit status. What goes wrong is one
/// line on standard error.
int runTool(const std::vector<std::string>& arguments, const std::vector<AddCommand>& commands);

/// What is wrong with an argument that is to be a path; empty when nothing is. For CLI11's checks.
std::string whyNotPath(const std::string& argument);

}  // namespace tools
