// SPDX-License-Identifier: MIT
// The driver of the Qt toolkit. Without a display it draws its windows off the screen.
#pragma once

#include <QPointer>
#include <QWidget>
#include <memory>

#include "drivers/paced_driver.hpp"
#include "qz/drivers/drawing.hpp"
#include "qz/drivers/measuring.hpp"
#include "qz/toolkit/qt/qt_toolkit.hpp"

namespace qz::drivers {

using namespace toolkit::qt;

extern template class PacedDriver<QtToolkit>;

/// Runs pending deleteLater() calls at its end, not in the next driver's event loop.
struct DeletionSweep {
  ~DeletionSweep();
};

// The first base ends last, after the toolkit.
class QtDriver final : DeletionSweep,
                       public PacedDriver<QtToolkit>,
                       public Drawing,
                       public Measuring {
 public:
  std::string_view name() const override { return "qt"; }

  Ref<Window> makeWindow(const Rect& content) override;
  /// An absent `parent` makes a view that is in no window yet.
  Ref<View> makeView(ViewKind kind, Tag tag, const Rect& frame, const Ref<View>& parent) override;
  void removeFromSuperview(const Ref<View>& view) override;
  void setFrame(const Ref<View>& view, const Rect& frame) override;
  void setWindowTitle(const Ref<Window>& window, std::string_view title) override;
  std::string_view className(ViewKind kind) const override;

  /// Presses and releases the mouse button on `view`.
  void click(const Ref<View>& view) override;
  void hold(const Ref<View>& view) override;
  void letGo() override;

  bool hasPerson() const override;
  bool savePicture(const Ref<Window>& window, const std::string& path) override;
  void drawAlike(std::span<const std::string_view> fonts) override;
  Pixels draw(const Ref<Window>& window, double density) override;
  std::string pngOf(const Pixels& pixels) override;
  void workOffScreen() override;
  MissingRoom missingRoom(const Ref<View>& view) override;

  ViewPicture look(const Ref<View>& view) override;
  WindowPicture look(const Ref<Window>& window) override;

 private:
  void settle() override;
  void awaitEvents(double seconds) override;
  void settleWithoutFiring();

  std::unique_ptr<QObject> offScreen_;  // null while windows are shown
  QPointer<QWidget> held_;              // the mouse button is down on it; null while it is up
};

}  // namespace qz::drivers
