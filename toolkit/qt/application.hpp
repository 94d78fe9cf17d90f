// SPDX-License-Identifier: MIT
// The Qt toolkit's application: makes windows and controls, and knows the host's.
#pragma once

#include <memory>

#include "toolkit/application.hpp"
#include "toolkit/qt/desk.hpp"

class QWidget;

namespace toolkit::qt {

class QtApplication final : public Application {
 public:
  explicit QtApplication(Log& log) : desk_(std::make_shared<Desk>(log)) {}
  /// Windows that only the application kept alive end.
  ~QtApplication() override { desk_->letAllGo(); }
  QtApplication(const QtApplication&) = delete;
  QtApplication& operator=(const QtApplication&) = delete;

  Ref<Window> makeWindow(const Rect& content, StyleMask style, BackingStore backing,
                         bool defer) override;
  Ref<Button> makeButton(const Rect& frame) override;
  Ref<ImageView> makeImageView(const Rect& frame) override;
  Ref<TextField> makeTextField(const Rect& frame) override;
  /// The sheet's geometry and modality are as they were once it is ordered out. When the user sends
  /// it away, by Escape or its close button, it ends with the code 0, off the screen already, and
  /// nothing else happens: whether the walk-through is over then is for the delegate to say.
  void beginSheet(const Ref<Window>& sheet, const Ref<Window>& parent,
                  const std::shared_ptr<SheetDelegate>& delegate, void* contextInfo) override;
  void endSheet(const Ref<Window>& sheet, long returnCode) override;

  /// The window of a host's top-level widget. What the engine needs of it lives as long as somebody
  /// keeps the reference, which a host therefore does for the length of a walk-through.
  Ref<Window> window(QWidget& widget);
  /// The view of a host's widget.
  Ref<View> view(QWidget& widget);

  /// Shared by this application's windows and views, for whoever makes some of its own.
  const std::shared_ptr<Desk>& desk() const { return desk_; }

 private:
  std::shared_ptr<Desk> desk_;
};

}  // namespace toolkit::qt
