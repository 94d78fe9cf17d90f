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

/// A complete toolkit without a display, with a virtual clock.
class QZ_API MemoryToolkit final : public Toolkit {
 public:
  MemoryToolkit();
  ~MemoryToolkit() override;
  MemoryToolkit(const MemoryToolkit&) = delete;
  MemoryToolkit& operator=(const MemoryToolkit&) = delete;

  /// Returns what makes windows and controls, and shows sheets.
  MemoryApplication& application() override;
  /// Returns what schedules timers.
  RunLoop& runLoop() override;
  /// Returns what finds images by name.
  Images& images() override;
  /// Returns what finds fonts by name.
  Fonts& fonts() override;
  /// Returns what reads files, and knows the resource directory.
  SystemFiles& files() override;
  /// Returns what writes diagnostic lines.
  MemoryLog& log() override;

  /// Lets `seconds` pass on the toolkit's clock and fires the timers that come due on the way. A
  /// negative value counts as 0.
  void advance(double seconds);

  /// The toolkit's own classes, for its driver.
  struct Parts;
  /// Returns the toolkit's inner parts, for its driver.
  Parts& parts() { return *parts_; }

 private:
  const std::unique_ptr<Parts> parts_;
};

}  // namespace qz::toolkit::memory
