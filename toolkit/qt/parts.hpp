// SPDX-License-Identifier: MIT
// The parts of the Qt toolkit.
#pragma once

#include "qz/toolkit/qt/qt_toolkit.hpp"
#include "toolkit/qt/desk.hpp"
#include "toolkit/qt/fonts.hpp"
#include "toolkit/qt/images.hpp"
#include "toolkit/qt/run_loop.hpp"

namespace qz::toolkit::qt {

struct QtToolkit::Parts {
  Parts() : Parts(steadyClock) {}
  explicit Parts(Clock& clock) : runLoop(clock, application.desk()->calls) {}

  SteadyClock steadyClock;
  QtLog log;
  QtFiles files;
  QtImages images{files};
  QtFonts fonts;
  QtApplication application{log};
  // Last, so that it is destroyed first: the actions of its timers hold engines, whose destructors
  // still use the other members.
  QtRunLoop runLoop;
};

}  // namespace qz::toolkit::qt
