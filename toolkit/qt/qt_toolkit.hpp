// SPDX-License-Identifier: MIT
// The Qt toolkit: real windows, made with Qt Widgets. Make it after the host's `QApplication`,
// destroy it before, and use it only on that thread. docs/toolkits.md lists its rules.
#pragma once

#include "toolkit/qt/application.hpp"
#include "toolkit/qt/clock.hpp"
#include "toolkit/qt/fonts.hpp"
#include "toolkit/qt/images.hpp"
#include "toolkit/qt/log.hpp"
#include "toolkit/qt/run_loop.hpp"
#include "toolkit/system_files.hpp"
#include "toolkit/toolkit.hpp"

namespace toolkit::qt {

class QtToolkit final : public Toolkit {
 public:
  QtToolkit() : QtToolkit(steadyClock_) {}
  /// Uses another clock, which must outlive the toolkit.
  explicit QtToolkit(Clock& clock) : runLoop_(clock, application_.desk()->calls) {}
  QtToolkit(const QtToolkit&) = delete;
  QtToolkit& operator=(const QtToolkit&) = delete;

  QtApplication& application() override { return application_; }
  QtRunLoop& runLoop() override { return runLoop_; }
  QtImages& images() override { return images_; }
  QtFonts& fonts() override { return fonts_; }
  SystemFiles& files() override { return files_; }
  QtLog& log() override { return log_; }

  /// Handles exceptions that escape from an action, a timer or a sheet's delegate.
  Calls& calls() { return application_.desk()->calls; }

 private:
  SteadyClock steadyClock_;
  QtLog log_;
  SystemFiles files_;
  QtImages images_{files_};
  QtFonts fonts_;
  QtApplication application_{log_};
  // Declared last so that it ends first: its timers' actions hold engines, which still use the
  // other roles when they end.
  QtRunLoop runLoop_;
};

}  // namespace toolkit::qt
