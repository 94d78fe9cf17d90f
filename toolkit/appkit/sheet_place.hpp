// SPDX-License-Identifier: MIT
// The place of a sheet: over its parent, which takes no clicks and no keys meanwhile.
//
// AppKit's own sheets are not used, because GNUstep's run a modal session that blocks their caller
// and in which timers of the default mode wait.
#pragma once

#import <AppKit/AppKit.h>

#import "toolkit/foundation/kept.hpp"

namespace qz::toolkit::appkit {

/// Attaches a sheet to a window, as long as this object lives.
class SheetPlace {
 public:
  SheetPlace(NSWindow* sheet, NSWindow* parent);
  ~SheetPlace();
  /// Whether a sheet is attached to the window.
  static bool covers(NSWindow* window);
  SheetPlace(const SheetPlace&) = delete;
  SheetPlace& operator=(const SheetPlace&) = delete;

 private:
  foundation::Kept<NSView*> cover_;  // over the parent's content
};

}  // namespace qz::toolkit::appkit
