// SPDX-License-Identifier: MIT
// The commands of qz-walkthrough. A new one is a row of commands.inc.
#pragma once

#include <vector>

#include "tools/command_line.hpp"

namespace qz::tools {

// The entries, such as playCommand.
#define QZ_COMMAND(name) extern const CommandEntry name##Command;
#include "tools/commands.inc"
#undef QZ_COMMAND

/// Returns all entries, in the order of the help.
inline std::vector<CommandEntry> allCommands() {
  return {
#define QZ_COMMAND(name) name##Command,
#include "tools/commands.inc"
#undef QZ_COMMAND
  };
}

}  // namespace qz::tools
