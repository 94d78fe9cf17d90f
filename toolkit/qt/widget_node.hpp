// SPDX-License-Identifier: MIT
// What all views of the Qt toolkit have in common, whatever their role: the widget that each stands
// for. `QtView` joins it to a role.
//
// Invariants: a widget has one view at a time; the view outlives the widget as one that is not
// there any more, of which every question is answered with zero and every change does nothing. What
// a view hangs on its widget to work goes with the view; what a script shows there stays.
#pragma once

#include <QPointer>
#include <QWidget>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "toolkit/geometry.hpp"
#include "toolkit/qt/desk.hpp"
#include "toolkit/view.hpp"

namespace toolkit::qt {

/// The dynamic property of a widget that is its tag, a whole number. Without it the tag is 0.
inline constexpr const char* tagProperty = "qzTag";
/// The dynamic property that makes a label an image view when it is set to true, also while it
/// shows no pixmap.
inline constexpr const char* imageViewProperty = "qzImageView";

/// Who ends a widget that lies in no other.
enum class Widget { host, view };

class WidgetNode : public std::enable_shared_from_this<WidgetNode> {
 public:
  WidgetNode(QWidget& widget, std::shared_ptr<Desk> desk, Widget keptBy);
  virtual ~WidgetNode();
  WidgetNode(const WidgetNode&) = delete;
  WidgetNode& operator=(const WidgetNode&) = delete;

  /// The node of `view`; null when it is absent or another toolkit's.
  static std::shared_ptr<WidgetNode> of(const Ref<View>& view);
  /// The view that this is the node of.
  Ref<View> view();
  /// The widget, or null when it is gone.
  QWidget* widget() const { return widget_; }

  /// Puts it to `frame` of its superview; remembered exactly until the host moves it.
  void place(const Rect& frame);
  /// Takes it out of its superview; from then on it ends with its view.
  void removeFromSuperview();
  bool isHidden() const;
  /// The view around it, or absent.
  Ref<View> superview() const;

 protected:
  virtual View& role() = 0;

  std::string nameOfClass() const;
  Tag readTag() const;
  void writeTag(Tag tag);
  Rect readFrame() const;
  const Subviews& readSubviews();
  /// As `View::addSubview`. Raises an invalid-argument exception, changing nothing, when `view` is
  /// absent, another toolkit's, a window's content view, or this view or one around it.
  void insert(const Ref<View>& view);
  void hide(bool hidden);
  void enable(bool enabled);
  /// Something that shows has changed: a redraw is pending until the next painting.
  void changed();
  bool isRedrawPending() const { return widget_ && isRedrawPending_; }
  QPointer<QWidget> widget_;
  std::shared_ptr<Desk> desk_;

 private:
  class Watch;
  struct Placement {
    Rect frame;      // as asked for
    QRect geometry;  // what Qt has made of it
    int areaHeight;  // of the superview
  };

  bool isOutside() const;  // of any other, and no window either
  bool isWhereItWasPut() const;

  const QWidget* const key_;  // in the desk's table
  Widget keptBy_;
  bool hadTag_;                 // before this toolkit saw it
  bool hiddenOutside_ = false;  // as it will be when it lies in another
  std::optional<Placement> placement_;
  Subviews subviews_;
  std::vector<QPointer<QWidget>> listed_;  // the widgets of `subviews_`; null once they are gone
  mutable std::optional<Tag> tag_;         // as read last, for every search reads them all
  bool isRedrawPending_ = false;
  std::unique_ptr<Watch> watch_;
};

}  // namespace toolkit::qt
