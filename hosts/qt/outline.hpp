// SPDX-License-Identifier: MIT
// Where a walk-through is, for progress meters.
#pragma once

#include "qz/engine.hpp"
#include "qz/progress_meter.hpp"

namespace qz::hosts::qt {

/// Returns where the walk-through of an engine is, for a progress meter.
WindowOutline outlineOf(const QZ_Plist_State_Parser& engine);

}  // namespace qz::hosts::qt
