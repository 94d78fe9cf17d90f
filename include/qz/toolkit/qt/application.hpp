// SPDX-License-Identifier: MIT
// The Qt toolkit's application: makes windows and controls, and wraps those of the host.
#pragma once

#include <memory>

#include "qz/api.hpp"
#include "qz/toolkit/application.hpp"
#include "qz/toolkit/log.hpp"

class QWidget;

namespace qz::toolkit::qt {

class Desk;

/// Makes windows and controls of Qt Widgets.
class QZ_API QtApplication final : public Application {
 public:
  /// `log` must outlive this object.
  explicit QtApplication(Log& log);
  /// Ends the windows that only the application keeps alive.
  ~QtApplication() override;
  QtApplication(const QtApplication&) = delete;
  QtApplication& operator=(const QtApplication&) = delete;

  Ref<Window> makeWindow(const Rect& content, StyleMask style, BackingStore backing,
                         bool defer) override;
  Ref<Button> makeButton(const Rect& frame) override;
  /// Makes an image view. It has no superview yet.
  Ref<ImageView> makeImageView(const Rect& frame) override;
  /// Makes a text field. It has no superview yet.
  Ref<TextField> makeTextField(const Rect& frame) override;
  /// Shows the sheet until it is ordered out, which restores its position, transient parent and
  /// modality. If the user dismisses the sheet, by Escape or its close button, it ends with code 0
  /// and is already off the screen. Nothing else happens: the delegate decides whether the
  /// walk-through ends.
  void beginSheet(const Ref<Window>& sheet, const Ref<Window>& parent,
                  const std::shared_ptr<SheetDelegate>& delegate, void* contextInfo) override;
  void endSheet(const Ref<Window>& sheet, long returnCode) override;

  /// Returns the window of a host's top-level widget. The wrapper lives as long as somebody holds
  /// the reference, so a host must hold it during a walk-through.
  Ref<Window> window(QWidget& widget);
  /// Returns the view of a host's widget.
  Ref<View> view(QWidget& widget);

  /// The desk that this application's windows and views share, for code that makes more of them.
  const std::shared_ptr<Desk>& desk() const { return desk_; }

 private:
  std::shared_ptr<Desk> desk_;
};

}  // namespace qz::toolkit::qt
