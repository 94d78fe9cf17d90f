// SPDX-License-Identifier: MIT
// The parts of the AppKit toolkit.
#pragma once

#include "qz/toolkit/appkit/appkit_toolkit.hpp"
#import "toolkit/appkit/desk.hpp"
#import "toolkit/appkit/fonts.hpp"
#import "toolkit/appkit/images.hpp"
#import "toolkit/appkit/run_loop.hpp"

namespace qz::toolkit::appkit {

struct AppKitToolkit::Parts {
  Parts() : Parts(steadyClock) {}
  explicit Parts(Clock& clock) : runLoop(clock, application.desk()->calls) {}

  SteadyClock steadyClock;
  AppKitLog log;
  AppKitFiles files;
  AppKitImages images{files};
  AppKitFonts fonts;
  AppKitApplication application{log};
  // Last, so that it is destroyed first: the actions of its timers hold engines, whose destructors
  // still use the other members.
  AppKitRunLoop runLoop;
};

}  // namespace qz::toolkit::appkit
