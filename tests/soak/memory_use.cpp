// SPDX-License-Identifier: MIT
// The memory that this process uses, as reported by the C library or the sanitizer and the kernel.

#include "tests/soak/memory_use.hpp"

#include <cstddef>
#include <fstream>

#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
#define QZ_SOAK_SANITIZED 1
#elif defined(__has_feature)
#if __has_feature(address_sanitizer) || __has_feature(thread_sanitizer)
#define QZ_SOAK_SANITIZED 1
#endif
#endif

#if defined(QZ_SOAK_SANITIZED)
// Every sanitizer has this function; not every compiler provides the header.
extern "C" std::size_t __sanitizer_get_current_allocated_bytes();
#elif defined(__GLIBC__)
#include <malloc.h>
#endif

#if defined(__linux__)
#include <unistd.h>
#endif

namespace qz {

namespace {

std::int64_t heapBytes() {
#if defined(QZ_SOAK_SANITIZED)
  return static_cast<std::int64_t>(__sanitizer_get_current_allocated_bytes());
#elif defined(__GLIBC__)
  const auto info = mallinfo2();
  return static_cast<std::int64_t>(info.uordblks + info.hblkhd);
#else
  return 0;
#endif
}

std::int64_t residentBytes() {
#if defined(__linux__)
  std::ifstream file("/proc/self/statm");
  std::int64_t pages = 0;
  std::int64_t residentPages = 0;
  file >> pages >> residentPages;
  return residentPages * sysconf(_SC_PAGESIZE);
#else
  return 0;
#endif
}

}  // namespace

MemoryUse memoryUse() { return {heapBytes(), residentBytes()}; }

bool knowsHeap() { return heapBytes() > 0; }

bool knowsResident() {
#if defined(QZ_SOAK_SANITIZED)
  return false;
#else
  return residentBytes() > 0;
#endif
}

}  // namespace qz
