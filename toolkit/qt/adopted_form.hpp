// SPDX-License-Identifier: MIT
// What the views of an adopted window share: which widgets are its controls, and what a change of
// one of them brings with it.
#pragma once

#include <QPointer>
#include <QWidget>
#include <optional>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "qz/toolkit/qt/adoption.hpp"
#include "toolkit/qt/trace.hpp"

class QAction;
class QMenu;
class QStackedWidget;

namespace qz::toolkit::qt {

/// True if `widget`, a child of a widget of a form, belongs to the form too: if it is not a window,
/// if it is a dock, a tool bar or a menu, or if it is marked as a panel.
bool isPartOfForm(const QWidget& widget);

/// The controls that a walk through the widgets of a form has found.
struct Listing {
  /// Widgets and actions in the order of the widget tree. The actions of a menu come behind it; an
  /// action that a tool bar shows is the button there.
  std::vector<QObject*> controls;
  /// The stacks on the way, and how many pages each had.
  std::vector<std::pair<QPointer<const QStackedWidget>, int>> stacks;

  /// True if no stack has lost a page, which it keeps as a child. No event tells of that.
  bool hasAllPages() const;
};

/// How much of a control's change the user is to see.
enum class Notice : std::uint8_t { none, shown, flash };

class AdoptedForm final : public QObject {
 public:
  AdoptedForm(QWidget& window, Adoption how);

  /// Remembers the size of the window when its layout enlarges it.
  bool eventFilter(QObject* receiver, QEvent* event) override;

  /// Returns the widget that holds the window's controls; null if it is gone. The central widget of
  /// a main window that has one, otherwise the window.
  QWidget* content() const;
  /// Walks through the form and adds its controls to `found`.
  void list(Listing& found) const;
  /// True if some tags depend on object names, whose changes no event tells.
  bool usesNames() const { return !how_.tags.empty(); }
  /// Returns the tag that a widget or an action without the property `qzTag` has by its name, or a
  /// widget by its action; absent if it has none.
  std::optional<Tag> givenTag(const QObject& object) const;
  /// Returns a sentence for each tag in the window that no command can reach.
  std::vector<std::string> unreachableTags() const;

  /// Returns all that a change of `widget` can change, as `changed` needs it; nothing if the
  /// adoption does not restore it. A change that is shown also changes what the host changes in
  /// return: it may enable a button when a text is no longer empty.
  std::vector<Sighting> look(QWidget& widget, Aspect aspect, Notice notice) const;
  /// The same for a change of an action.
  std::vector<Sighting> look(QAction& action) const;
  /// Brings a changed control into view (null for an action), if the adoption says so. A flash does
  /// so only once for each control, so that it does not drag back a user who has gone elsewhere.
  /// Remembers what has changed since `before`.
  void changed(QWidget* widget, Notice notice, const std::vector<Sighting>& before);
  /// Restores what has been remembered, and from now on every change at once: a list may still
  /// run.
  void restore();

 private:
  void attend(QWidget& widget, Notice notice);
  void addTagged(const QWidget& around, Listing& found) const;
  void addTaggedFrom(QWidget& widget, Listing& found) const;
  void addTaggedInPanels(Listing& found) const;
  void addActionsOf(const QMenu& menu, std::vector<QObject*>& found) const;
  bool isTagged(const QObject& object) const;
  std::optional<Tag> namedTag(const QObject& object) const;
  std::string complaintAbout(const QObject& object) const;

  QPointer<QWidget> window_;
  Adoption how_;
  std::set<const QWidget*> flashed_;
  Trace trace_;
  bool isOver_ = false;
};

}  // namespace qz::toolkit::qt
