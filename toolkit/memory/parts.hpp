// SPDX-License-Identifier: MIT
// The parts of the memory toolkit.
#pragma once

#include "qz/toolkit/memory/memory_toolkit.hpp"
#include "toolkit/memory/fonts.hpp"
#include "toolkit/memory/images.hpp"
#include "toolkit/memory/run_loop.hpp"
#include "toolkit/memory/screen.hpp"

namespace qz::toolkit::memory {

struct MemoryToolkit::Parts {
  MemoryLog log;
  SystemFiles files;
  MemoryImages images{files};
  MemoryFonts fonts;
  MemoryApplication application;
  // Last, so that it is destroyed first: the actions of its timers hold engines, whose destructors
  // still use the other members.
  MemoryRunLoop runLoop;
};

}  // namespace qz::toolkit::memory
