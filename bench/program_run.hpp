// SPDX-License-Identifier: MIT
// Runs other programs and measures them.
#pragma once

#include <string>

namespace qz::bench {

struct ProgramRun {
  int status = 0;        ///< with which the program exited
  std::string output{};  ///< its standard output
  double wall = 0;       ///< seconds, from its start to its end
  double processor = 0;  ///< seconds, of the program and the operating system for it
};

/// Runs a command line of the shell. Ends this program if that is impossible, or if a signal ends
/// the command.
ProgramRun runProgram(const std::string& commandLine);

}  // namespace qz::bench
