// SPDX-License-Identifier: MIT
// The Qt toolkit: real windows, made with Qt Widgets. Make it after the host's `QApplication`,
// destroy it before, and use it only on that thread. docs/toolkits.md lists its rules.
#pragma once

#include <memory>

#include "qz/toolkit/qt/application.hpp"
#include "qz/toolkit/qt/calls.hpp"
#include "qz/toolkit/qt/clock.hpp"
#include "qz/toolkit/qt/files.hpp"
#include "qz/toolkit/qt/log.hpp"
#include "qz/toolkit/toolkit.hpp"

namespace qz::toolkit::qt {

class QtToolkit final : public Toolkit {
 public:
  QtToolkit();
  /// Uses another clock, which must outlive the toolkit.
  explicit QtToolkit(Clock& clock);
  ~QtToolkit() override;
  QtToolkit(const QtToolkit&) = delete;
  QtToolkit& operator=(const QtToolkit&) = delete;

  QtApplication& application() override;
  RunLoop& runLoop() override;
  Images& images() override;
  Fonts& fonts() override;
  QtFiles& files() override;
  QtLog& log() override;

  /// Handles exceptions that escape from an action, a timer or a sheet's delegate.
  Calls& calls();

  /// The toolkit's own classes, for its driver.
  struct Parts;
  Parts& parts() { return *parts_; }

 private:
  const std::unique_ptr<Parts> parts_;
};

}  // namespace qz::toolkit::qt
