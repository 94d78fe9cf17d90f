// SPDX-License-Identifier: MIT
// The memory that this process uses.
#pragma once

#include <cstdint>

namespace qz {

/// The memory in use at one moment, in bytes. A figure that the system does not report exactly
/// enough is 0.
struct MemoryUse {
  std::int64_t heap = 0;      ///< allocated and not freed
  std::int64_t resident = 0;  ///< in physical memory; a sanitizer keeps freed memory there for long
};

MemoryUse memoryUse();

/// True if this system reports the heap memory in use.
bool knowsHeap();
/// True if resident memory tells something about the program, rather than about a sanitizer.
bool knowsResident();

}  // namespace qz
