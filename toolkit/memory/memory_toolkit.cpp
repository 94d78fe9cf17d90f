// SPDX-License-Identifier: MIT
// The memory toolkit: gives access to its parts.

#include "qz/toolkit/memory/memory_toolkit.hpp"

#include "toolkit/memory/parts.hpp"

namespace qz::toolkit::memory {

MemoryToolkit::MemoryToolkit() : parts_(std::make_unique<Parts>()) {}
// The engines that timers hold end while `parts_` still leads to the parts that they use.
MemoryToolkit::~MemoryToolkit() { parts_->runLoop.invalidateAll(); }

MemoryApplication& MemoryToolkit::application() { return parts_->application; }
RunLoop& MemoryToolkit::runLoop() { return parts_->runLoop; }
Images& MemoryToolkit::images() { return parts_->images; }
Fonts& MemoryToolkit::fonts() { return parts_->fonts; }
SystemFiles& MemoryToolkit::files() { return parts_->files; }
MemoryLog& MemoryToolkit::log() { return parts_->log; }

void MemoryToolkit::advance(double seconds) { parts_->runLoop.advance(seconds); }

}  // namespace qz::toolkit::memory
