// SPDX-License-Identifier: MIT
// The memory toolkit: a complete toolkit without a display. Its windows, views, sheets, responder
// chain and clock work as in AppKit, and every run gives the same result; docs/toolkits.md lists
// its rules.
#pragma once

#include <memory>

#include "qz/api.hpp"
#include "qz/toolkit/memory/application.hpp"
#include "qz/toolkit/memory/log.hpp"
#include "qz/toolkit/system_files.hpp"
#include "qz/toolkit/toolkit.hpp"

namespace qz::toolkit::memory {

class QZ_API MemoryToolkit final : public Toolkit {
 public:
  MemoryToolkit();
  ~MemoryToolkit() override;
  MemoryToolkit(const MemoryToolkit&) = delete;
  MemoryToolkit& operator=(const MemoryToolkit&) = delete;

  MemoryApplication& application() override;
  RunLoop& runLoop() override;
  Images& images() override;
  Fonts& fonts() override;
  SystemFiles& files() override;
  MemoryLog& log() override;

  /// Lets `seconds` pass on the toolkit's clock and fires the timers that come due on the way. A
  /// negative value counts as 0.
  void advance(double seconds);

  /// The toolkit's own classes, for its driver.
  struct Parts;
  Parts& parts() { return *parts_; }

 private:
  const std::unique_ptr<Parts> parts_;
};

}  // namespace qz::toolkit::memory
