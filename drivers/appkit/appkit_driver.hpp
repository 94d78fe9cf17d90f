// SPDX-License-Identifier: MIT
// The driver of the AppKit toolkit, which needs a display.
#pragma once

#import <AppKit/AppKit.h>

#include "drivers/paced_driver.hpp"
#include "qz/toolkit/appkit/appkit_toolkit.hpp"
#import "toolkit/foundation/kept.hpp"

namespace qz::drivers {

using namespace toolkit::appkit;

extern template class PacedDriver<AppKitToolkit>;

class AppKitDriver final : public PacedDriver<AppKitToolkit> {
 public:
  ~AppKitDriver() override;

  std::string_view name() const override { return "appkit"; }

  Ref<Window> makeWindow(const Rect& content) override;
  /// An absent `parent` makes a view that is in no window yet.
  Ref<View> makeView(ViewKind kind, Tag tag, const Rect& frame, const Ref<View>& parent) override;
  void removeFromSuperview(const Ref<View>& view) override;
  void setFrame(const Ref<View>& view, const Rect& frame) override;
  void setWindowTitle(const Ref<Window>& window, std::string_view title) override;
  std::string_view className(ViewKind kind) const override;

  /// Presses and releases the mouse button on `view`. A pop-up button sends its action without
  /// opening its menu.
  void click(const Ref<View>& view) override;
  /// Only pretends to hold the button: AppKit would not return before it is released.
  void hold(const Ref<View>& view) override;
  void letGo() override;
  void advance(double seconds) override;

  bool hasPerson() const override { return true; }
  bool savePicture(const Ref<Window>& window, const std::string& path) override;
  ViewPicture look(const Ref<View>& view) override;
  WindowPicture look(const Ref<Window>& window) override;

 private:
  void settle() override;
  void awaitEvents(double seconds) override;
  void setHeld(bool held);

  bool isHeld_ = false;                      // the mouse button is held down
  toolkit::foundation::Kept<NSView*> held_;  // the button that it holds, until a keyboard click
};

}  // namespace qz::drivers
