// SPDX-License-Identifier: MIT
// What a walk-through has changed in a form, and how the form was before.
#pragma once

#include <QPointer>
#include <QVariant>
#include <QWidget>
#include <vector>

#include "toolkit/qt/facets.hpp"

class QAction;

namespace qz::toolkit::qt {

/// A facet of a widget or an action at some moment.
struct Sighting {
  QPointer<QObject> object;
  const Facet* facet;
  QVariant value;
};

/// A change of a widget by a command.
struct WidgetChange {
  QWidget& widget;
  Aspect aspect;
  bool bringsIntoView;  ///< so that the widgets around it may change, too
  bool withReactions;   ///< so that the host may change widgets of the window in return
};

/// Returns every facet that a change can change.
std::vector<Sighting> sightingsAround(const WidgetChange& change);
/// The same for an action of `window`.
std::vector<Sighting> sightingsAround(QAction& action, QWidget& window, bool withReactions);

class Trace {
 public:
  /// Remembers what has changed since the sightings.
  void note(const std::vector<Sighting>& before);
  /// Remembers that a facet was as sighted, and that we have changed it to `now`.
  void remember(const Sighting& before, const QVariant& now);
  /// Restores all that was noted, except what somebody else has changed since, and forgets it.
  void undo();

 private:
  struct Entry {
    QPointer<QObject> object;
    const Facet* facet;
    QVariant original;
    QVariant ours;
    bool isOurs() const { return object && facet->read(*object) == ours; }
  };

  void undoNoted();

  std::vector<Entry> entries_;
};

}  // namespace qz::toolkit::qt
