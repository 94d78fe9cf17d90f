// SPDX-License-Identifier: MIT
// The Qt toolkit's windows, which are also its sheets.
//
// A sheet is a window-modal window in front of its parent, at the top edge of the parent's content.
// What that changes about the window ends when it is no sheet any more.
#pragma once

#include <QPointer>
#include <QWidget>
#include <memory>
#include <optional>
#include <vector>

#include "toolkit/application.hpp"
#include "toolkit/geometry.hpp"
#include "toolkit/qt/desk.hpp"
#include "toolkit/window.hpp"

namespace toolkit::qt {

class SheetPlace;

/// Who keeps a window alive: the host, or who asked the driver or the application for it; the
/// application also does while it is on the screen.
enum class KeptBy { host, maker, application };

class QtWindow final : public Window, public std::enable_shared_from_this<QtWindow> {
 public:
  /// The window of a top-level widget. Unless it is the host's, the widget ends with the window.
  static std::shared_ptr<QtWindow> make(QWidget& widget, const std::shared_ptr<Desk>& desk,
                                        KeptBy keptBy);
  /// A new window, not yet shown, of the content rectangle in screen coordinates.
  static std::shared_ptr<QtWindow> make(const Rect& content, StyleMask style,
                                        const std::shared_ptr<Desk>& desk, KeptBy keptBy);
  ~QtWindow() override;
  QtWindow(const QtWindow&) = delete;
  QtWindow& operator=(const QtWindow&) = delete;

  /// `window` as a window of this toolkit; null when it is absent or another toolkit's.
  static std::shared_ptr<QtWindow> of(const Ref<Window>& window);
  /// The widget, or null when it is gone.
  QWidget* widget() const { return widget_; }

  /// Of a main window its central widget's view, of any other the widget's own. Absent when that is
  /// gone.
  Ref<View> contentView() const override;
  std::shared_ptr<Responder> delegate() const override { return delegate_.lock(); }
  void setDelegate(const std::shared_ptr<Responder>& delegate) override { delegate_ = delegate; }
  void setBackgroundColor(const Color& color) override;
  void makeKeyAndOrderFront() override;
  void orderOut() override;
  /// Closes the widget, which its host can refuse, and which ends it if the host wants that.
  void close() override;

  /// The content rectangle in screen coordinates: the one that it was made with, until somebody
  /// moves the window.
  Rect content() const;
  /// How often it was closed, by whomever.
  int closes() const { return closes_; }

  /// Shows it attached to `parent`, which may be null. A window is never its own sheet's sheet:
  /// then it is shown on its own. Begun again before it was ended, only the latest delegate is
  /// told.
  void beginAsSheet(const std::shared_ptr<QtWindow>& parent,
                    const std::shared_ptr<SheetDelegate>& delegate, void* contextInfo);
  /// Tells the delegate if its showing as a sheet was not ended before, also when it is off the
  /// screen by now. It stays where it is.
  void endAsSheet(long returnCode);
  /// The window that it is attached to as a sheet, or null.
  std::shared_ptr<QtWindow> sheetParent() const { return sheetParent_.lock(); }
  /// The return codes of all ends asked for, in order.
  const std::vector<long>& sheetEnds() const { return sheetEnds_; }

 private:
  class Watch;
  struct Session {
    std::weak_ptr<SheetDelegate> delegate;  // its own maker's
    void* contextInfo;
  };

  QtWindow(QWidget& widget, std::shared_ptr<Desk> desk, KeptBy keptBy);

  void show();
  void detach();
  void wasHidden();

  QPointer<QWidget> widget_;
  std::shared_ptr<Desk> desk_;
  const QWidget* const key_;  // in the desk's table
  KeptBy keptBy_;
  std::unique_ptr<Watch> watch_;
  mutable Ref<View> content_;                // owned, so that the views last as long as the window
  mutable QPointer<QWidget> contentWidget_;  // whose view that is
  std::weak_ptr<Responder> delegate_;        // its own maker's
  std::optional<Rect> asked_;                // the content rectangle that it was made with
  std::optional<QRect> settled_;             // what the desktop made of it at the first showing
  int closes_ = 0;
  std::weak_ptr<QtWindow> sheetParent_;  // its own keeper's
  std::unique_ptr<SheetPlace> place_;    // while it is attached
  std::optional<Session> session_;       // from the beginning of a sheet to its end
  std::vector<long> sheetEnds_;
};

}  // namespace toolkit::qt
