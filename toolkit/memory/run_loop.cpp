// SPDX-License-Identifier: MIT
// Letting time pass.

#include "toolkit/memory/run_loop.hpp"

#include <limits>

namespace toolkit::memory {

void MemoryRunLoop::advance(double seconds) {
  // A never-ending advance would leave a clock on which nothing is ever due again.
  const double end = std::numeric_limits<double>::max();
  const double target = std::min(now_ + (seconds > 0 ? seconds : 0), end);
  fireDue(target);
  now_ = std::max(now_, target);
}

}  // namespace toolkit::memory
