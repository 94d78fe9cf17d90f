// SPDX-License-Identifier: MIT
// Writes a walk as a scenario: its moves, and what the user sees after each.
#pragma once

#include <string>

#include "tools/check/scenario_words.hpp"

namespace qz::tools::cover {

/// A walk as a file.
struct WrittenScenario {
  std::string name;  ///< what the user does, as a file's name without its ending
  std::string text;
};

/// The first line of every scenario that is written so. A file that begins otherwise is somebody's
/// own.
inline constexpr const char* signature = "# Written by qz-walkthrough cover.";

WrittenScenario scenarioOf(const check::WrittenPlay& play, const check::Path& path);

}  // namespace qz::tools::cover
