// SPDX-License-Identifier: MIT
// What all views of the Qt toolkit have in common, whatever their role: the widget behind each.
// `QtView` joins a node to a role.
//
// Invariants: a widget has one view at a time. A view may outlive its widget; then every question
// returns zero and every change does nothing. Helper objects that a view attaches to its widget end
// with the view; what a script has shown there stays.
#pragma once

#include <QPointer>
#include <QWidget>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "qz/toolkit/geometry.hpp"
#include "qz/toolkit/view.hpp"
#include "toolkit/backend/kept_by.hpp"
#include "toolkit/qt/desk.hpp"

namespace qz::toolkit::qt {

/// The dynamic property of a widget that holds its tag, a whole number. Without it the tag is 0.
inline constexpr const char* tagProperty = "qzTag";
/// The dynamic property that makes a label an image view if it is true, even while the label shows
/// no pixmap.
inline constexpr const char* imageViewProperty = "qzImageView";

class WidgetNode : public std::enable_shared_from_this<WidgetNode> {
 public:
  /// `keptBy` says who deletes the widget while it has no parent: the host, or this node
  /// (`holder`).
  WidgetNode(QWidget& widget, std::shared_ptr<Desk> desk, KeptBy keptBy);
  virtual ~WidgetNode();
  WidgetNode(const WidgetNode&) = delete;
  WidgetNode& operator=(const WidgetNode&) = delete;

  /// Returns the node of `view`; null if it is absent or another toolkit's.
  static std::shared_ptr<WidgetNode> of(const Ref<View>& view);
  /// Returns the view of this node.
  Ref<View> view();
  /// Returns the widget; null if it is gone.
  QWidget* widget() const { return widget_; }

  /// Moves the widget to `frame` in its superview. The exact frame is remembered until the host
  /// moves the widget.
  void place(const Rect& frame);
  /// Takes the widget out of its superview; from then on the widget ends with its view.
  void removeFromSuperview();
  bool isHidden() const;
  /// Returns the superview; absent if there is none.
  Ref<View> superview() const;

 protected:
  virtual View& role() = 0;

  std::string nameOfClass() const;
  Tag readTag() const;
  void writeTag(Tag tag);
  Rect readFrame() const;
  const Subviews& readSubviews();
  /// As `View::addSubview`. Raises an invalid-argument exception, and changes nothing, if `view` is
  /// absent, another toolkit's, a window's content view, this view or one of its superviews.
  void insert(const Ref<View>& view);
  void hide(bool hidden);
  void enable(bool enabled);
  /// Marks a visible change: a redraw is pending until the next paint event.
  void changed();
  bool isRedrawPending() const { return widget_ && isRedrawPending_; }
  QPointer<QWidget> widget_;
  std::shared_ptr<Desk> desk_;

 private:
  class Watch;
  struct Placement {
    Rect frame;      // as asked for
    QRect geometry;  // the widget's geometry after that
    int areaHeight;  // of the superview
  };

  bool isOutside() const;  // has no superview, and is not a window
  bool isWhereItWasPut() const;

  const QWidget* const key_;  // in the desk's table
  KeptBy keptBy_;
  bool hadTag_;                 // before this view was made
  bool hiddenOutside_ = false;  // applies when it is inserted again
  std::optional<Placement> placement_;
  Subviews subviews_;
  std::vector<QPointer<QWidget>> listed_;  // the widgets of `subviews_`; null once they are gone
  mutable std::optional<Tag> tag_;         // cached, because every search reads all tags
  bool isRedrawPending_ = false;
  std::unique_ptr<Watch> watch_;
};

}  // namespace qz::toolkit::qt
