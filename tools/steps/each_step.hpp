// SPDX-License-Identifier: MIT
// Shows every step of a source, to look at it.
#pragma once

#include <functional>
#include <memory>

#include "tools/steps/source.hpp"

namespace qz::tools::steps {

/// Returns a driver that suits, of the toolkits with a display; null if this build has none, or if
/// none can work here.
std::unique_ptr<drivers::Driver> findDriver(const std::function<bool(drivers::Driver&)>& suits);

/// Begins the walk-through at each step in turn, and calls `see` with the step and the stage.
/// Throws a Failure if the window that the source names cannot be made.
void showEachStep(const Source& source, drivers::Driver& driver,
                  const std::function<void(StepIndex, walkthrough::Stage&)>& see);

}  // namespace qz::tools::steps
