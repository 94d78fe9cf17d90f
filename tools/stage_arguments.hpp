// SPDX-License-Identifier: MIT
// The options that commands share: in which window, and on which toolkit, a script plays.
#pragma once

#include <optional>
#include <string>

#include "tools/command_line.hpp"
#include "tools/walkthrough/stage.hpp"

namespace qz::tools {

/// The options that name the window, so that a command can exclude them.
struct WindowArguments {
  Command::Option window;
  Command::Option assets;
};

/// Adds --window, --assets, --resources and --sheet.
WindowArguments addStageOptions(Command& command, walkthrough::StageOptions& stage,
                                std::optional<std::string>& resources);

/// Returns these options as arguments of `play`, each behind a blank; empty without any.
std::string playStageArguments(const walkthrough::StageOptions& stage,
                               const std::optional<std::string>& resources);

/// Adds --toolkit, whose default is the variable's present value. `help` says what the toolkit is
/// for; the names of the toolkits follow.
void addToolkitOption(Command& command, std::string& toolkit, const std::string& help);

}  // namespace qz::tools
