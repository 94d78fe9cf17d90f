// SPDX-License-Identifier: MIT
// The memory toolkit's windows, which are also its sheets.
#pragma once

#include <memory>
#include <optional>
#include <vector>

#include "toolkit/application.hpp"
#include "toolkit/geometry.hpp"
#include "toolkit/memory/screen.hpp"
#include "toolkit/window.hpp"

namespace toolkit::memory {

/// The background of a window that was given none (`windowBackgroundColor` in AppKit's light look).
inline constexpr Color windowBackground{236 / 255.0, 236 / 255.0, 236 / 255.0};

/// Who keeps a window alive: its makers always can; the application does while it is on the screen.
enum class KeptBy { maker, application };

class MemoryWindow final : public Window, public std::enable_shared_from_this<MemoryWindow> {
 public:
  /// A window, not yet shown, with an empty content view. Without its screen it cannot be shown.
  static std::shared_ptr<MemoryWindow> make(const std::shared_ptr<Screen>& screen,
                                            const Rect& content, StyleMask style, KeptBy keptBy);
  ~MemoryWindow() override;
  /// `window` as a window of this toolkit; null when it is absent or another toolkit's.
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
  /// How often it was closed.
  int closes() const { return closes_; }
  /// Whether clicks reach its views: it is on the screen and no sheet is attached to it.
  bool takesInput() const;

  /// Shows it attached to `parent`, which may be null. A window is never its own sheet's sheet:
  /// then it is shown on its own. Begun again before it was ended, only the latest delegate is
  /// told.
  void beginAsSheet(const std::shared_ptr<MemoryWindow>& parent,
                    const std::shared_ptr<SheetDelegate>& delegate, void* contextInfo);
  /// Tells the delegate if its showing as a sheet was not ended before, also when it is off the
  /// screen by now. It stays where it is.
  void endAsSheet(long returnCode);
  /// The window that it is attached to as a sheet, or null.
  std::shared_ptr<MemoryWindow> sheetParent() const { return sheetParent_.lock(); }
  /// The return codes of all ends asked for, in order.
  const std::vector<long>& sheetEnds() const { return sheetEnds_; }

 private:
  MemoryWindow(const std::shared_ptr<Screen>& screen, const Rect& content, StyleMask style,
               KeptBy keptBy);

  struct Session {
    std::weak_ptr<SheetDelegate> delegate;  // its own maker's
    void* contextInfo;
  };

  std::weak_ptr<Screen> screen_;  // the application's
  Rect content_;
  StyleMask style_;
  KeptBy keptBy_;
  std::shared_ptr<View> contentView_;
  std::weak_ptr<Responder> delegate_;  // its own maker's
  Color background_ = windowBackground;
  int closes_ = 0;
  std::weak_ptr<MemoryWindow> sheetParent_;  // its own keeper's
  std::optional<Session> session_;           // from the beginning of a sheet to its end
  std::vector<long> sheetEnds_;
};

}  // namespace toolkit::memory
