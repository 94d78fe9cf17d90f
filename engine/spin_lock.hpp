// SPDX-License-Identifier: MIT
// A spin lock, for locks that are held for a few instructions and hardly ever contended.
#pragma once

#include <atomic>
#include <thread>

namespace qz {

/// No foreign code may run while it is held. A `std::mutex` would work too, but costs some sixty
/// instructions even without contention, and the engine reads its properties at every command.
class SpinLock {
 public:
  void lock() {
    while (held_.test_and_set(std::memory_order_acquire)) std::this_thread::yield();
  }
  void unlock() { held_.clear(std::memory_order_release); }

 private:
  std::atomic_flag held_;
};

}  // namespace qz
