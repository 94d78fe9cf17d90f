// SPDX-License-Identifier: MIT
// The memory toolkit: a complete toolkit without a display. Its windows, views, sheets, responder
// chain and clock work as in AppKit, and every run gives the same result; docs/toolkits.md lists
// its rules.
#pragma once

#include "toolkit/memory/application.hpp"
#include "toolkit/memory/fonts.hpp"
#include "toolkit/memory/images.hpp"
#include "toolkit/memory/log.hpp"
#include "toolkit/memory/run_loop.hpp"
#include "toolkit/system_files.hpp"
#include "toolkit/toolkit.hpp"

namespace toolkit::memory {

class MemoryToolkit final : public Toolkit {
 public:
  MemoryToolkit() = default;
  MemoryToolkit(const MemoryToolkit&) = delete;
  MemoryToolkit& operator=(const MemoryToolkit&) = delete;

  MemoryApplication& application() override { return application_; }
  MemoryRunLoop& runLoop() override { return runLoop_; }
  MemoryImages& images() override { return images_; }
  MemoryFonts& fonts() override { return fonts_; }
  SystemFiles& files() override { return files_; }
  MemoryLog& log() override { return log_; }

 private:
  MemoryLog log_;
  SystemFiles files_;
  MemoryImages images_{files_};
  MemoryFonts fonts_;
  MemoryApplication application_;
  // Last, so that it is destroyed first: the actions of its timers hold engines, whose destructors
  // still use the other members.
  MemoryRunLoop runLoop_;
};

}  // namespace toolkit::memory
