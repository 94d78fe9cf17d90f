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
#include "toolkit/qt/view_change.hpp"

namespace qz::toolkit::qt {

/// The dynamic property of a widget that holds its tag, a whole number. Without it the tag is 0.
inline constexpr const char* tagProperty = "qzTag";
/// The dynamic property that makes a label an image view if it is true, even while the label shows
/// no pixmap.
inline constexpr const char* imageViewProperty = "qzImageView";

/// The dynamic property of a button or an action that leads its presses both to
/// the host and to the button's target if it is "both". Otherwise a press goes to the target, if
/// there is one.
inline constexpr const char* pressProperty = "qzPress";

/// True if the presses of an object with the property are for both.
inline bool isMarkedForBoth(const QObject& object) {
  return object.property(pressProperty) == "both";
}

/// The dynamic property that makes a child of a window a part of the adopted window if it is true,
/// even if the child is a window too: its widgets with tags are controls.
inline constexpr const char* panelProperty = "qzPanel";

/// True if `child`, a child of a widget, is a subview: a widget that is not a window. A child is
/// null while Qt deletes it together with its siblings.
bool isSubview(const QObject* child);

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
  /// Makes the view a control of an adopted window while `form` lives. `tag` is the tag of a widget
  /// that has no tag of its own.
  void joinForm(const std::shared_ptr<AdoptedForm>& form, Tag tag);
  bool isInForm() const { return !form_.expired(); }
  /// Brings the widget into view as a command that changes it does, if it is a control of an
  /// adopted window.
  void comeIntoView() { const auto noted = change(Aspect::place, Notice::shown); }

 protected:
  virtual View& role() = 0;

  std::string nameOfClass() const;
  Tag readTag() const;
  void writeTag(Tag tag);
  Rect readFrame() const;
  /// Returns the subviews: the child widgets, unless a subclass presents others.
  virtual const Subviews& readSubviews();
  /// Makes the views of `objects`, widgets and actions, the subviews.
  void present(const std::vector<QObject*>& objects);
  /// True if the subviews are those of `objects`.
  bool presents(const std::vector<QObject*>& objects) const;
  /// True if no object that the subviews show has been destroyed.
  bool presentsOnlyLiving() const;
  const Subviews& presented() const { return subviews_; }
  /// As `View::addSubview`. Raises an invalid-argument exception, and changes nothing, if `view` is
  /// absent, another toolkit's, a window's content view, this view or one of its superviews.
  void insert(const Ref<View>& view);
  void hide(bool hidden);
  void enable(bool enabled);
  /// Marks a visible change: a redraw is pending until the next paint event.
  void changed();
  bool isRedrawPending() const { return widget_ && isRedrawPending_; }
  /// Surrounds a change of the widget by a command.
  ViewChange change(Aspect aspect, Notice notice = Notice::none);
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
  bool hadTag_;                      // before this view was made
  Tag givenTag_ = 0;                 // that of a widget without the property
  std::weak_ptr<AdoptedForm> form_;  // owned by its AdoptedWindow
  bool hiddenOutside_ = false;       // applies when it is inserted again
  std::optional<Placement> placement_;
  Subviews subviews_;
  std::vector<QPointer<QObject>> listed_;  // what `subviews_` show; null once it is gone
  mutable std::optional<Tag> tag_;         // cached, because every search reads all tags
  bool isRedrawPending_ = false;
  std::unique_ptr<Watch> watch_;
};

}  // namespace qz::toolkit::qt
