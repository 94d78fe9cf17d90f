// SPDX-License-Identifier: MIT
// Makes the storyboard of a script: a page with every step, to click through.
#pragma once

#include <functional>
#include <string>

#include "tools/check/check.hpp"

namespace qz::tools::storyboard {

struct StoryboardOptions {
  check::CheckOptions check;   ///< what the script is played on, and what is allowed
  std::string stageArguments;  ///< the arguments of `play` that set up the window, or empty
  std::string toolkit;         ///< that draws; if it draws nothing, the page shows texts
  std::size_t limit = 500;     ///< steps of the page
  /// Called while pictures are drawn, with how many are done and how many there will be.
  std::function<void(std::size_t, std::size_t)> drawing = [](std::size_t, std::size_t) {};
};

struct Storyboard {
  std::string html;
  std::size_t steps = 0;     ///< of the page
  std::size_t leftOut = 0;   ///< steps that are not on the page
  std::size_t pictures = 0;  ///< drawn
  std::size_t findings = 0;
  bool isComplete = false;  ///< everything was explored
};

/// Throws a Failure if a file does not hold what it should.
Storyboard makeStoryboard(const InputFile& file, const StoryboardOptions& options,
                          const check::ExplorationHooks& hooks);

}  // namespace qz::tools::storyboard
