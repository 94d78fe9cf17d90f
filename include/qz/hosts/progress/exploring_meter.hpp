// SPDX-License-Identifier: MIT
// A progress meter that explores the script, as `qz-walkthrough check` does.
#pragma once

#include <cstddef>
#include <memory>

#include "qz/progress_meter.hpp"

namespace qz::hosts::progress {

/// How far a meter explores. Beyond that the progress is not known.
struct ExplorationBounds {
  std::size_t places = 100'000;
  std::size_t bytes = std::size_t{64} << 20U;  ///< of memory, about
  double seconds = 10;
};

/// Returns a meter that explores each script on a thread of its own, once for each walk-through. A
/// step counts as a press, or as a wait for a timer.
std::shared_ptr<ProgressMeter> exploringMeter(const ExplorationBounds& bounds = {});

}  // namespace qz::hosts::progress
