// SPDX-License-Identifier: MIT
// The exported command names.

#include "tools/scenario/command_names.hpp"

#include <cassert>

#include "qz/commands.hpp"

namespace qz::tools::scenario {

std::vector<std::string_view> commandConstants() {
  std::vector<std::string_view> constants;
  for (const Command& command : commandCatalogue()) constants.push_back(command.constant);
  return constants;
}

RenamedCommands::~RenamedCommands() {
  // In reverse, because a command may have been renamed twice.
  for (auto change = before_.rbegin(); change != before_.rend(); ++change) {
    *change->first = std::move(change->second);
  }
}

void RenamedCommands::rename(std::string_view constant, std::string name) {
  const Command* const command = commandOfConstant(constant);
  assert(command);
  before_.emplace_back(&command->name, std::exchange(command->name, std::move(name)));
}

}  // namespace qz::tools::scenario
