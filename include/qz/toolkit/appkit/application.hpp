// SPDX-License-Identifier: MIT
// The AppKit toolkit's application: makes windows and controls, and wraps those of the host.
#pragma once

#include <memory>

#include "qz/api.hpp"
#include "qz/toolkit/appkit/object.hpp"
#include "qz/toolkit/application.hpp"
#include "qz/toolkit/log.hpp"

namespace qz::toolkit::appkit {

class Desk;

/// The application and its windows.
class QZ_API AppKitApplication final : public Application {
 public:
  /// Makes one whose exceptions are written to `log`.
  explicit AppKitApplication(Log& log);
  /// Ends the windows that only the application keeps alive.
  ~AppKitApplication() override;
  AppKitApplication(const AppKitApplication&) = delete;
  AppKitApplication& operator=(const AppKitApplication&) = delete;

  Ref<Window> makeWindow(const Rect& content, StyleMask style, BackingStore backing,
                         bool defer) override;
  Ref<Button> makeButton(const Rect& frame) override;
  Ref<ImageView> makeImageView(const Rect& frame) override;
  Ref<TextField> makeTextField(const Rect& frame) override;
  void beginSheet(const Ref<Window>& sheet, const Ref<Window>& parent,
                  const std::shared_ptr<SheetDelegate>& delegate, void* contextInfo) override;
  void endSheet(const Ref<Window>& sheet, long returnCode) override;

  /// Returns the window of a host's `NSWindow`; absent for nil. The wrapper lives as long as
  /// somebody holds the reference, so a host must hold it during a walk-through. The window is
  /// retained.
  Ref<Window> window(NSWindow* window);
  /// Returns the view of a host's `NSView`; absent for nil. The view is retained.
  Ref<View> view(NSView* view);
  /// Returns the AppKit object behind a window of this toolkit; nil for an absent one and for
  /// another toolkit's.
  NSWindow* object(const Ref<Window>& window) const;
  /// The same for a view.
  NSView* object(const Ref<View>& view) const;

  /// Makes `object`, which is not retained, the target and delegate that AppKit sees wherever
  /// `responder` is one. Without this, AppKit sees an object of the toolkit's own that performs the
  /// responder's actions. Null removes `object` again. Do that before `object` is
  /// deallocated.
  void present(const std::shared_ptr<Responder>& responder, void* object);

  /// The desk that this application's windows and views share, for code that makes more of them.
  const std::shared_ptr<Desk>& desk() const { return desk_; }

 private:
  std::shared_ptr<Desk> desk_;
};

}  // namespace qz::toolkit::appkit
