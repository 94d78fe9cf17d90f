// SPDX-License-Identifier: MIT
// The AppKit toolkit's windows, which are also its sheets.
//
// A sheet is shown without AppKit's modal session (see sheet_place.hpp).
#pragma once

#import <AppKit/AppKit.h>

#include <memory>
#include <optional>
#include <vector>

#include "qz/toolkit/application.hpp"
#include "qz/toolkit/geometry.hpp"
#include "qz/toolkit/window.hpp"
#import "toolkit/appkit/desk.hpp"
#import "toolkit/appkit/responders.hpp"
#import "toolkit/appkit/sheet_place.hpp"
#include "toolkit/backend/kept_by.hpp"
#include "toolkit/backend/sheet_session.hpp"
#import "toolkit/foundation/kept.hpp"

namespace qz::toolkit::appkit {

class AppKitWindow final : public Window, public std::enable_shared_from_this<AppKitWindow> {
 public:
  /// Makes the window of an `NSWindow`, which is retained. Unless the host keeps it, it leaves the
  /// screen at the end of this window.
  static std::shared_ptr<AppKitWindow> make(NSWindow* window, const std::shared_ptr<Desk>& desk,
                                            KeptBy keptBy);
  /// Makes a new window, not yet shown, with the content rectangle in screen coordinates.
  static std::shared_ptr<AppKitWindow> make(const Rect& content, StyleMask style,
                                            BackingStore backing, bool defer,
                                            const std::shared_ptr<Desk>& desk, KeptBy keptBy);
  ~AppKitWindow() override;
  AppKitWindow(const AppKitWindow&) = delete;
  AppKitWindow& operator=(const AppKitWindow&) = delete;

  /// Returns `window` as a window of this toolkit; null if it is absent or another toolkit's.
  static std::shared_ptr<AppKitWindow> of(const Ref<Window>& window);
  NSWindow* object() const { return object_.get(); }

  Ref<View> contentView() const override;
  std::shared_ptr<Responder> delegate() const override;
  void setDelegate(const std::shared_ptr<Responder>& delegate) override;
  void setBackgroundColor(const Color& color) override;
  void makeKeyAndOrderFront() override;
  void orderOut() override;
  void close() override;

  /// Returns the content rectangle in screen coordinates: exactly as requested until somebody
  /// resizes the window.
  Rect content() const;
  Color backgroundColor() const;
  /// Returns how often it was closed, by the engine, the host or the user.
  int closes() const { return closes_; }

  /// Shows the window attached to `parent`, which may be null. If that would attach the window to
  /// itself, even indirectly, shows it unattached. If it begins again before its end, only the
  /// latest delegate learns of the end.
  void beginAsSheet(const std::shared_ptr<AppKitWindow>& parent,
                    const std::shared_ptr<SheetDelegate>& delegate, void* contextInfo);
  /// Ends the sheet and tells the delegate, unless the sheet has ended already. Does not hide the
  /// window.
  void endAsSheet(long returnCode);
  /// Returns the window that it is attached to as a sheet; null if none.
  std::shared_ptr<AppKitWindow> sheetParent() const { return sheetParent_.lock(); }
  /// Returns the return codes of all requested ends, in order.
  const std::vector<long>& sheetEnds() const { return session_.ends(); }

  /// Called by AppKit when the window closes.
  void willClose();

 private:
  AppKitWindow(NSWindow* window, std::shared_ptr<Desk> desk, KeptBy keptBy);
  void detach();

  foundation::Kept<NSWindow*> object_;
  std::shared_ptr<Desk> desk_;
  KeptBy keptBy_;
  foundation::Kept<id> watch_;  // hears of the window's closing
  mutable Ref<View> content_;   // owned, so that the views live as long as the window
  Stand delegate_;
  std::optional<Rect> asked_;        // the requested content rectangle
  std::optional<Color> background_;  // as it was set
  int closes_ = 0;
  bool isClosing_ = false;
  std::weak_ptr<AppKitWindow> sheetParent_;  // owned by its keeper
  std::unique_ptr<SheetPlace> place_;        // while it is attached
  SheetSession session_;
};

}  // namespace qz::toolkit::appkit
