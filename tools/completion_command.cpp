// SPDX-License-Identifier: MIT
// The command `completion`.
#include <iostream>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "tools/commands.hpp"
#include "tools/completion_scripts.hpp"
#include "tools/support/failure.hpp"
#include "tools/support/suggestions.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools {
namespace {

std::vector<std::string_view> shellNames() {
  std::vector<std::string_view> names;
  for (const CompletionShell& shell : completionShells()) names.push_back(shell.name);
  return names;
}

std::string shellList() {
  const auto names = shellNames();
  return enumerate({names.begin(), names.end()});
}

/// Prints the script of the shell. Throws a Failure if there is no such shell.
int printScript(const std::string& shell) {
  for (const CompletionShell& one : completionShells()) {
    if (one.name != shell) continue;
    std::cout << one.script(outlineOf(allCommands()));
    return static_cast<int>(ExitStatus::fine);
  }
  throw Failure(ExitStatus::badInput, "expected a shell, " + shellList() + ", found " +
                                          quote(shell) + didYouMean(shell, shellNames()));
}

void describeCompletion(Command& command) {
  const auto shell = std::make_shared<std::string>();
  command.argument("SHELL", *shell, "The shell: " + shellList()).choices(shellNames());
  command.action([shell] { return printScript(*shell); });
}

}  // namespace

constexpr CommandEntry completionCommand{
    "completion", "Print a script with which a shell completes the command line",
    describeCompletion};

}  // namespace qz::tools
