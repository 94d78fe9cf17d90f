// SPDX-License-Identifier: MIT
// The driver of the Qt toolkit. Without a display it draws its windows off the screen.
#pragma once

#include <QPointer>
#include <QWidget>
#include <exception>
#include <functional>
#include <memory>

#include "drivers/paced_clock.hpp"
#include "qz/drivers/driver.hpp"
#include "qz/drivers/measuring.hpp"
#include "qz/toolkit/qt/qt_toolkit.hpp"

namespace qz::drivers {

using namespace toolkit::qt;

class QtDriver final : public Driver, public Measuring {
 public:
  /// Makes the application object if there is none.
  QtDriver();

  std::string_view name() const override { return "qt"; }
  QtToolkit& toolkit() override { return toolkit_; }

  Ref<Window> makeWindow(const Rect& content) override;
  /// An absent `parent` makes a view that is in no window yet.
  Ref<View> makeView(ViewKind kind, Tag tag, const Rect& frame, const Ref<View>& parent) override;
  void removeFromSuperview(const Ref<View>& view) override;
  void setFrame(const Ref<View>& view, const Rect& frame) override;
  void setCaption(const Ref<View>& view, std::string_view text) override;
  void setWindowTitle(const Ref<Window>& window, std::string_view title) override;
  void setResourcePath(std::string_view path) override;
  std::string_view className(ViewKind kind) const override;

  /// Presses and releases the mouse button on `view`.
  void click(const Ref<View>& view) override;
  void hold(const Ref<View>& view) override;
  void letGo() override;
  /// The clock runs only during this call and `handOver`.
  void advance(double seconds) override;
  void useRealTime() override { realTime_ = true; }

  bool hasPerson() const override;
  void handOver(const std::function<void(const Ref<View>&)>& willAct,
                const std::function<bool()>& goesOn) override;

  bool draws() const override { return true; }
  bool savePicture(const Ref<Window>& window, const std::string& path) override;
  void workOffScreen() override;
  MissingRoom missingRoom(const Ref<View>& view) override;

  ViewPicture look(const Ref<View>& view) override;
  WindowPicture look(const Ref<Window>& window) override;
  void setLogSink(std::function<void(std::string_view)> sink) override;

 private:
  void wait(double seconds);
  void jump(double seconds);
  void settle();
  void settleWithoutFiring();
  void raiseWhatWasThrown();

  // Runs pending deleteLater() calls now, not in the next driver's event loop.
  struct Sweep {
    ~Sweep();
  };

  bool realTime_ = false;
  std::unique_ptr<QObject> offScreen_;  // null while windows are shown
  QPointer<QWidget> held_;              // the mouse button is down on it; null while it is up
  PacedClock clock_;
  const Sweep atTheEnd_{};
  std::exception_ptr thrown_;  // by the last click or advance
  QtToolkit toolkit_{clock_};
};

}  // namespace qz::drivers
