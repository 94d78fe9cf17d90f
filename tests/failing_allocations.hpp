// SPDX-License-Identifier: MIT
// Replaces the program's operator new, so that any allocation can be made to fail. Include it in
// exactly one file of a program.
#pragma once

#include <gtest/gtest.h>

#include <cstddef>
#include <cstdlib>
#include <functional>
#include <limits>
#include <new>

namespace qz::failing_allocations {

constexpr std::size_t never = std::numeric_limits<std::size_t>::max();

// Per thread, so that allocations of other threads do not count.
inline thread_local std::size_t allocationsLeft = never;
inline thread_local std::ptrdiff_t allocationsAlive = 0;

/// Runs `action` with its first allocation failing, then its second, and so on until none fails;
/// returns the number of failures. `action` must destroy everything that it makes, or it counts as
/// leaked.
inline int failuresOf(const std::function<void()>& action) {
  action();  // makes everything that is made once for the whole program
  for (int failures = 0;; ++failures) {
    const std::ptrdiff_t before = allocationsAlive;
    bool failed = false;
    allocationsLeft = static_cast<std::size_t>(failures);
    try {
      action();
    } catch (const std::bad_alloc&) {
      failed = true;
    }
    allocationsLeft = never;
    EXPECT_EQ(allocationsAlive, before) << "with allocation " << failures << " failing";
    if (!failed) return failures;
  }
}

}  // namespace qz::failing_allocations

void* operator new(std::size_t size) {
  using namespace qz::failing_allocations;
  if (allocationsLeft == 0) throw std::bad_alloc();
  if (allocationsLeft != never) --allocationsLeft;
  void* memory = std::malloc(size == 0 ? 1 : size);
  if (!memory) throw std::bad_alloc();
  ++allocationsAlive;
  return memory;
}

void operator delete(void* memory) noexcept {
  if (memory) --qz::failing_allocations::allocationsAlive;
  std::free(memory);
}

void operator delete(void* memory, std::size_t) noexcept { operator delete(memory); }
