// SPDX-License-Identifier: MIT
// The Qt toolkit: real windows, made with Qt Widgets. Make it after the host's `QApplication`,
// destroy it before, and use it only on that thread. docs/toolkits.md lists its rules.
#pragma once

#include <memory>

#include "qz/api.hpp"
#include "qz/toolkit/qt/application.hpp"
#include "qz/toolkit/qt/calls.hpp"
#include "qz/toolkit/qt/clock.hpp"
#include "qz/toolkit/qt/files.hpp"
#include "qz/toolkit/qt/log.hpp"
#include "qz/toolkit/toolkit.hpp"

namespace qz::toolkit::qt {

/// The toolkit on Qt 6 Widgets. It needs an application object.
class QZ_API QtToolkit final : public Toolkit {
 public:
  QtToolkit();
  /// Uses another clock, which must outlive the toolkit.
  explicit QtToolkit(Clock& clock);
  ~QtToolkit() override;
  QtToolkit(const QtToolkit&) = delete;
  QtToolkit& operator=(const QtToolkit&) = delete;

  /// Returns what makes windows and controls, and shows sheets.
  QtApplication& application() override;
  /// Returns what schedules timers.
  RunLoop& runLoop() override;
  /// Returns what finds images by name.
  Images& images() override;
  /// Returns what finds fonts by name.
  Fonts& fonts() override;
  /// Returns what reads files and Qt resources, and knows the resource directory.
  QtFiles& files() override;
  /// Returns what writes diagnostic lines.
  QtLog& log() override;

  /// Handles exceptions that escape from an action, a timer or a sheet's delegate.
  Calls& calls();

  /// The toolkit's own classes, for its driver.
  struct Parts;
  /// Returns the toolkit's inner parts, for its driver.
  Parts& parts() { return *parts_; }

 private:
  const std::unique_ptr<Parts> parts_;
};

}  // namespace qz::toolkit::qt
