// SPDX-License-Identifier: MIT
// What Qt tells assistive technology. Qt passes it on only while such technology is connected,
// which needs a desktop's message bus, so this program replaces Qt's own functions.
#pragma once

#include <QAccessible>
#include <vector>

namespace qz::hosts {

struct Announcement {
  const QObject* object;
  QAccessible::Event event;
  // What assistive technology reads of the object at that moment. Not for events that may come from
  // an object that is half destroyed.
  QAccessible::Role role = QAccessible::NoRole;
  QString name = {};
  QString description = {};
};

/// Everything that has been announced since a test last called `listen`.
inline std::vector<Announcement> announcements;

/// Nothing is recorded before the first call of `listen`: recording asks Qt for an object's
/// accessible interface, for which Qt connects to the object's signal `destroyed`. Until then
/// `QAccessible::isActive` says that no assistive technology is connected.
inline bool isListening = false;

inline void listen() {
  isListening = true;
  announcements.clear();
}

}  // namespace qz::hosts
