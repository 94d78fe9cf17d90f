// SPDX-License-Identifier: MIT
// Lets time pass.

#include "toolkit/memory/run_loop.hpp"

#include <limits>

namespace qz::toolkit::memory {

void MemoryRunLoop::advance(double seconds) {
  // After an infinite advance, the clock would stand at infinity and no timer would ever be due
  // again.
  const double end = std::numeric_limits<double>::max();
  const double target = std::min(now_ + (seconds > 0 ? seconds : 0), end);
  fireDue(target);
  now_ = std::max(now_, target);
}

}  // namespace qz::toolkit::memory
