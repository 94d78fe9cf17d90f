// SPDX-License-Identifier: MIT
// Makes a script of a walk-through in steps.
#pragma once

#include <map>
#include <string>
#include <vector>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/format_readers.hpp"
#include "tools/steps/scenes.hpp"

namespace qz::tools::steps {

/// A script, and what its numbers stand for.
struct Built {
  toolkit::ValueRef<toolkit::Dictionary> script{};
  toolkit::ValueOffsets offsets{};                      ///< where its values come from
  std::vector<std::string> startKeys{};                 ///< one for each step to start at
  std::map<toolkit::Tag, ControlIndex> controlOfTag{};  ///< for every tag that a control can have
  std::map<std::string, StepIndex> stepOfKey{};         ///< to which step the list of a key leads
};

/// Builds the script. It starts at the first of `starts`, under its smallest key; the others have
/// start keys of their own, and `mostWays` limits them as in `findScenes`. What is wrong is added
/// to `mistakes`; then there is no script.
Built build(const Tour& tour, const std::vector<StepIndex>& starts, Mistakes& mistakes,
            std::size_t mostWays = mostUsableWays);

}  // namespace qz::tools::steps
