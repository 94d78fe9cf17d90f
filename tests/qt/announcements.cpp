// SPDX-License-Identifier: MIT
// Records what Qt announces.
#include "tests/qt/announcements.hpp"

namespace {

bool isOfWholeObject(QAccessible::Event event) {
  return event == QAccessible::NameChanged || event == QAccessible::DescriptionChanged ||
         event == QAccessible::Alert || event == QAccessible::Focus;
}

}  // namespace

bool QAccessible::isActive() { return qz::hosts::isListening; }

void QAccessible::updateAccessibility(QAccessibleEvent* event) {
  if (!qz::hosts::isListening) return;
  qz::hosts::Announcement said{event->object(), event->type()};
  const bool canBeRead = event->object() && isOfWholeObject(event->type());
  const auto* const known = canBeRead ? event->accessibleInterface() : nullptr;
  if (known) {
    said.role = known->role();
    said.name = known->text(QAccessible::Name);
    said.description = known->text(QAccessible::Description);
  }
  qz::hosts::announcements.push_back(said);
}
