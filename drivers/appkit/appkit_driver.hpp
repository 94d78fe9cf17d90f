// SPDX-License-Identifier: MIT
// The driver of the AppKit toolkit, which needs a display.
#pragma once

#import <AppKit/AppKit.h>

#include <exception>
#include <functional>

#include "drivers/paced_clock.hpp"
#include "qz/drivers/driver.hpp"
#include "qz/toolkit/appkit/appkit_toolkit.hpp"
#import "toolkit/foundation/kept.hpp"

namespace qz::drivers {

using namespace toolkit::appkit;

class AppKitDriver final : public Driver {
 public:
  AppKitDriver();
  ~AppKitDriver() override;

  std::string_view name() const override { return "appkit"; }
  AppKitToolkit& toolkit() override { return toolkit_; }

  Ref<Window> makeWindow(const Rect& content) override;
  /// An absent `parent` makes a view that is in no window yet.
  Ref<View> makeView(ViewKind kind, Tag tag, const Rect& frame, const Ref<View>& parent) override;
  void removeFromSuperview(const Ref<View>& view) override;
  void setFrame(const Ref<View>& view, const Rect& frame) override;
  void setCaption(const Ref<View>& view, std::string_view text) override;
  void setWindowTitle(const Ref<Window>& window, std::string_view title) override;
  void setResourcePath(std::string_view path) override;
  std::string_view className(ViewKind kind) const override;

  /// Presses and releases the mouse button on `view`. A pop-up button sends its action without
  /// opening its menu.
  void click(const Ref<View>& view) override;
  /// Only pretends to hold the button: AppKit would not return before it is released.
  void hold(const Ref<View>& view) override;
  void letGo() override;
  /// The clock runs only during this call and `handOver`.
  void advance(double seconds) override;
  void useRealTime() override { realTime_ = true; }

  bool hasPerson() const override { return true; }
  void handOver(const std::function<void(const Ref<View>&)>& willAct,
                const std::function<bool()>& goesOn) override;

  bool draws() const override { return true; }
  bool savePicture(const Ref<Window>& window, const std::string& path) override;
  ViewPicture look(const Ref<View>& view) override;
  WindowPicture look(const Ref<Window>& window) override;
  void setLogSink(std::function<void(std::string_view)> sink) override;

 private:
  void wait(double seconds);
  void jump(double seconds);
  void settle();
  void setHeld(bool held);
  void raiseWhatWasThrown();

  bool realTime_ = false;
  bool isHeld_ = false;                      // the mouse button is held down
  toolkit::foundation::Kept<NSView*> held_;  // the button that it holds, until a keyboard click
  PacedClock clock_;
  std::exception_ptr thrown_;  // by the last click or advance
  AppKitToolkit toolkit_{clock_};
};

}  // namespace qz::drivers
