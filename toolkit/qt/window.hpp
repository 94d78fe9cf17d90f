// SPDX-License-Identifier: MIT
// The Qt toolkit's windows, which are also its sheets.
//
// A sheet is a window-modal window in front of its parent, at the top edge of the parent's content.
// Changes that this makes to the window are undone when it stops being a sheet.
#pragma once

#include <QPointer>
#include <QWidget>
#include <memory>
#include <optional>
#include <vector>

#include "qz/toolkit/application.hpp"
#include "qz/toolkit/geometry.hpp"
#include "qz/toolkit/window.hpp"
#include "toolkit/backend/kept_by.hpp"
#include "toolkit/backend/sheet_session.hpp"
#include "toolkit/qt/desk.hpp"

namespace qz::toolkit::qt {

class AdoptedForm;
class SheetPlace;

class QtWindow final : public Window, public std::enable_shared_from_this<QtWindow> {
 public:
  /// Makes the window of a top-level widget. The widget ends with the window, unless the host keeps
  /// it.
  static std::shared_ptr<QtWindow> make(QWidget& widget, const std::shared_ptr<Desk>& desk,
                                        KeptBy keptBy);
  /// Makes a new window, not yet shown, with the content rectangle in screen coordinates.
  static std::shared_ptr<QtWindow> make(const Rect& content, StyleMask style,
                                        const std::shared_ptr<Desk>& desk, KeptBy keptBy);
  ~QtWindow() override;
  QtWindow(const QtWindow&) = delete;
  QtWindow& operator=(const QtWindow&) = delete;

  /// Returns `window` as a window of this toolkit; null if it is absent or another toolkit's.
  static std::shared_ptr<QtWindow> of(const Ref<Window>& window);
  /// Returns the widget; null if it is gone.
  QWidget* widget() const { return widget_; }

  /// Returns the view of a main window's central widget; for other windows, that of the widget
  /// itself. Absent if that widget is gone. While the window presents a form, the content view
  /// holds the form's controls.
  Ref<View> contentView() const override;
  std::shared_ptr<Responder> delegate() const override { return delegate_.lock(); }
  void setDelegate(const std::shared_ptr<Responder>& delegate) override { delegate_ = delegate; }
  /// Makes the content view hold the controls of `form`; null ends that.
  void present(std::shared_ptr<AdoptedForm> form);
  void setBackgroundColor(const Color& color) override;
  void makeKeyAndOrderFront() override;
  void orderOut() override;
  /// Closes the widget. Its host can refuse that, or have the widget deleted on close.
  void close() override;

  /// Returns the content rectangle in screen coordinates: exactly as requested until somebody moves
  /// or resizes the window.
  Rect content() const;
  /// Returns how often it was closed, by the engine, the host or the user.
  int closes() const { return closes_; }

  /// Shows the window attached to `parent`, which may be null. If that would attach the window to
  /// itself, even indirectly, shows it unattached. If it begins again before its end, only the
  /// latest delegate learns of the end.
  void beginAsSheet(const std::shared_ptr<QtWindow>& parent,
                    const std::shared_ptr<SheetDelegate>& delegate, void* contextInfo);
  /// Ends the sheet and tells the delegate, unless the sheet has ended already. Tells it even if
  /// the window is off the screen. Does not hide the window.
  void endAsSheet(long returnCode);
  /// Returns the window that it is attached to as a sheet; null if none.
  std::shared_ptr<QtWindow> sheetParent() const { return sheetParent_.lock(); }
  /// Returns the return codes of all requested ends, in order.
  const std::vector<long>& sheetEnds() const { return session_.ends(); }

 private:
  class Watch;
  QtWindow(QWidget& widget, std::shared_ptr<Desk> desk, KeptBy keptBy);

  QWidget* contentWidget() const;
  Ref<View> viewOf(QWidget& content) const;
  void show();
  void detach();
  void wasHidden();

  QPointer<QWidget> widget_;
  std::shared_ptr<Desk> desk_;
  const QWidget* const key_;  // in the desk's table
  KeptBy keptBy_;
  std::unique_ptr<Watch> watch_;
  mutable Ref<View> content_;                // owned, so that the views live as long as the window
  mutable QPointer<QWidget> contentWidget_;  // the widget of `content_`
  std::shared_ptr<AdoptedForm> form_;        // null unless the window presents one
  std::weak_ptr<Responder> delegate_;        // owned by the code that made it
  std::optional<Rect> asked_;                // the requested content rectangle
  std::optional<QRect> settled_;             // its geometry once first shown
  int closes_ = 0;
  std::weak_ptr<QtWindow> sheetParent_;  // owned by its keeper
  std::unique_ptr<SheetPlace> place_;    // while it is attached
  SheetSession session_;
};

}  // namespace qz::toolkit::qt
