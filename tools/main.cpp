// SPDX-License-Identifier: MIT
// qz-walkthrough: plays and tests scripted walk-throughs, prints and converts their files.
#include <string>
#include <vector>

#include "tools/commands.hpp"
#include "tools/shell.hpp"
#include "tools/support/stack_guard.hpp"

int main(int argc, char** argv) {
  qz::tools::installStackGuard();
  const std::vector<std::string> arguments(argv + (argc > 0 ? 1 : 0), argv + argc);
  return qz::tools::runTool(arguments, qz::tools::allCommands());
}
