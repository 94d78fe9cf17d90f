// SPDX-License-Identifier: MIT
// What Qt tells assistive technology. Qt passes it on only while such technology is connected,
// which needs a desktop's message bus, so this program replaces Qt's own function.
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

/// Whether objects are read. Qt then connects to each object, which other tests would count.
inline bool announcementsAreRead = false;

/// Everything that has been announced since a test emptied the list.
inline std::vector<Announcement> announcements;

}  // namespace qz::hosts
