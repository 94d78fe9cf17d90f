// SPDX-License-Identifier: MIT
// What the views of an adopted window share: which widgets are its controls, and what a change of
// one of them brings with it.
#pragma once

#include <QPointer>
#include <QWidget>
#include <optional>
#include <set>
#include <string>
#include <vector>

#include "qz/toolkit/qt/adoption.hpp"
#include "toolkit/qt/trace.hpp"

class QAction;

namespace qz::toolkit::qt {

/// True if `widget`, a child of a widget of a form, belongs to the form too: if it is not a window,
/// or if it is a dock or a tool bar, which may float as a window.
bool isPartOfForm(const QWidget& widget);

/// How much of a control's change the user is to see.
enum class Notice : std::uint8_t { none, shown, flash };

class AdoptedForm {
 public:
  AdoptedForm(QWidget& window, Adoption how);

  /// Returns the widget that holds the window's controls; null if it is gone. The central widget of
  /// a main window that has one, otherwise the window.
  QWidget* content() const;
  /// Adds the controls to `found`, in the order of the widget tree.
  void list(std::vector<QWidget*>& found) const;
  /// Returns the tag that a widget without the property `qzTag` has by its name or its action;
  /// absent if it has none.
  std::optional<Tag> givenTag(const QWidget& widget) const;
  /// Returns a sentence for each tag in the window that no command can reach.
  std::vector<std::string> unreachableTags() const;

  /// Returns all that a change of `widget` can change, as `changed` needs it; nothing if the
  /// adoption does not restore it.
  std::vector<Sighting> look(QWidget& widget) const;
  /// Brings a changed control into view, if the adoption says so. A flash does so only once for
  /// each control, so that it does not drag back a user who has gone elsewhere. Remembers what has
  /// changed since `before`.
  void changed(QWidget* widget, Notice notice, const std::vector<Sighting>& before);
  /// Restores what has been remembered, and from now on every change at once: a list may still
  /// run.
  void restore();

 private:
  void attend(QWidget& widget, Notice notice);
  void addTagged(const QWidget& around, std::vector<QWidget*>& found) const;
  void addTaggedFrom(QWidget& widget, std::vector<QWidget*>& found) const;
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
