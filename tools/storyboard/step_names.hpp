// SPDX-License-Identifier: MIT
// Names of steps, by what they are: a small change of a script changes few of them.
#pragma once

#include <string>
#include <vector>

#include "tools/storyboard/board.hpp"
#include "tools/walkthrough/step_picture.hpp"

namespace qz::tools::storyboard {

struct StepName {
  std::string id{};     ///< of small letters, digits and "-"; no two are the same
  std::string title{};  ///< for people
};

/// Returns the names of the steps. The first step of a group has the group's name, the others also
/// what is different in them.
std::vector<StepName> stepNames(const std::vector<BoardStep>& steps,
                                const std::vector<walkthrough::StepPicture>& pictures,
                                bool hasNames);

}  // namespace qz::tools::storyboard
