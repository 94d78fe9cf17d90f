// SPDX-License-Identifier: MIT
// Spin lock: for what is held for a few instructions and hardly ever waited for.
#pragma once

#include <atomic>
#include <thread>

/// Guards what no code of others runs under. A `std::mutex` would do; it takes some sixty
/// instructions where nobody waits, and the engine reads its properties at every command.
class SpinLock {
 public:
  void lock() {
    while (held_.test_and_set(std::memory_order_acquire)) std::this_thread::yield();
  }
  void unlock() { held_.clear(std::memory_order_release); }

 private:
  std::atomic_flag held_;
};
