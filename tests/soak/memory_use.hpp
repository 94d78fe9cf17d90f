// SPDX-License-Identifier: MIT
// How much memory this process uses.
#pragma once

#include <cstdint>

/// Bytes, at one moment. On a system that does not tell, or not exactly enough, a figure is 0.
struct MemoryUse {
  std::int64_t heap = 0;      ///< allocated and not freed
  std::int64_t resident = 0;  ///< in physical memory; a sanitizer keeps freed memory there for long
};

MemoryUse memoryUse();

/// Whether the memory in use is known on this system.
bool knowsHeap();
/// Whether resident memory says something about the program, rather than about a sanitizer.
bool knowsResident();
