// SPDX-License-Identifier: MIT
// What a walk-through has changed in a form, and how the form was before.
#pragma once

#include <QPointer>
#include <QVariant>
#include <QWidget>
#include <vector>

#include "toolkit/qt/facets.hpp"

namespace qz::toolkit::qt {

/// A facet of a widget at some moment.
struct Sighting {
  QPointer<QWidget> widget;
  const Facet* facet;
  QVariant value;
};

/// Returns every facet that a change of `widget` can change; with what the host may change in
/// return, in the whole window, if it is wanted.
std::vector<Sighting> sightingsAround(QWidget& widget, bool withReactions);

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
    QPointer<QWidget> widget;
    const Facet* facet;
    QVariant original;
    QVariant ours;
    bool isOurs() const { return widget && facet->read(*widget) == ours; }
  };

  void undoNoted();

  std::vector<Entry> entries_;
};

}  // namespace qz::toolkit::qt
