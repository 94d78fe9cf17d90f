// SPDX-License-Identifier: MIT
// The clock of the Qt toolkit's timers.
#pragma once

#include "qz/toolkit/clock.hpp"

namespace qz::toolkit::qt {

using toolkit::Clock;
using toolkit::SteadyClock;

}  // namespace qz::toolkit::qt
