// SPDX-License-Identifier: MIT
// The commands of qz-walkthrough. A new one is declared here and added to the list in main.cpp.
#pragma once

#include "tools/command_line.hpp"

namespace qz::tools {

extern const CommandEntry playCommand;     ///< plays a script
extern const CommandEntry checkCommand;    ///< checks scripts
extern const CommandEntry testCommand;     ///< runs scenarios
extern const CommandEntry dumpCommand;     ///< prints a property list
extern const CommandEntry convertCommand;  ///< writes a property list in another format

}  // namespace qz::tools
