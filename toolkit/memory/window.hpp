// SPDX-License-Identifier: MIT
// The memory toolkit's windows, which are also its sheets.
#pragma once

#include <memory>
#include <optional>
#include <vector>

#include "qz/toolkit/application.hpp"
#include "qz/toolkit/geometry.hpp"
#include "qz/toolkit/window.hpp"
#include "toolkit/backend/kept_by.hpp"
#include "toolkit/backend/sheet_session.hpp"
#include "toolkit/memory/screen.hpp"

namespace qz::toolkit::memory {

/// The default background of a window (`windowBackgroundColor` in AppKit's light appearance).
inline constexpr Color windowBackground{236 / 255.0, 236 / 255.0, 236 / 255.0};

class MemoryWindow final : public Window, public std::enable_shared_from_this<MemoryWindow> {
 public:
  /// Makes a hidden window with an empty content view. It cannot be shown once `screen` is
  /// destroyed.
  static std::shared_ptr<MemoryWindow> make(const std::shared_ptr<Screen>& screen,
                                            const Rect& content, StyleMask style, KeptBy keptBy);
  ~MemoryWindow() override;
  /// Returns `window` as a window of this toolkit; null if it is absent or belongs to another
  /// toolkit.
  static std::shared_ptr<MemoryWindow> of(const Ref<Window>& window);

  Ref<View> contentView() const override { return contentView_; }
  std::shared_ptr<Responder> delegate() const override { return delegate_.lock(); }
  void setDelegate(const std::shared_ptr<Responder>& delegate) override { delegate_ = delegate; }
  void setBackgroundColor(const Color& color) override { background_ = color; }
  void makeKeyAndOrderFront() override;
  void orderOut() override;
  void close() override;

  /// The content rectangle in screen coordinates.
  const Rect& content() const { return content_; }
  StyleMask style() const { return style_; }
  const Color& backgroundColor() const { return background_; }
  bool isKeptOnScreen() const { return keptBy_ == KeptBy::application; }
  bool isVisible() const;
  bool isKey() const;
  /// Returns how often the window was closed.
  int closes() const { return closes_; }
  /// Whether clicks reach the window's views: it is on the screen and no visible sheet is attached
  /// to it.
  bool takesInput() const;

  /// Shows the window attached to `parent`, which may be null. If `parent` is this window or
  /// attached to it, the window is shown on its own. If the sheet is begun again before its end,
  /// only the latest delegate learns of the end.
  void beginAsSheet(const std::shared_ptr<MemoryWindow>& parent,
                    const std::shared_ptr<SheetDelegate>& delegate, void* contextInfo);
  /// Tells the delegate unless the sheet was already ended, even if the window is no longer on the
  /// screen. Does not order the window out.
  void endAsSheet(long returnCode);
  /// Returns the window to which this one is attached as a sheet, or null.
  std::shared_ptr<MemoryWindow> sheetParent() const { return sheetParent_.lock(); }
  /// Returns the return codes of all requests to end the sheet, in order.
  const std::vector<long>& sheetEnds() const { return session_.ends(); }

 private:
  MemoryWindow(const std::shared_ptr<Screen>& screen, const Rect& content, StyleMask style,
               KeptBy keptBy);

  std::weak_ptr<Screen> screen_;  // owned by the application
  Rect content_;
  StyleMask style_;
  KeptBy keptBy_;
  std::shared_ptr<View> contentView_;
  std::weak_ptr<Responder> delegate_;  // kept alive by its owner
  Color background_ = windowBackground;
  int closes_ = 0;
  std::weak_ptr<MemoryWindow> sheetParent_;  // kept alive by its owner
  SheetSession session_;
};

}  // namespace qz::toolkit::memory
