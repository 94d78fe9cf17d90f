// SPDX-License-Identifier: MIT
// Qt sends an event for each change of what a widget holds, but only to that widget, so this
// listens to the events of all.

#include "toolkit/qt/tree_watch.hpp"

#include <QChildEvent>
#include <QCoreApplication>
#include <QDynamicPropertyChangeEvent>

#include "toolkit/qt/widget_node.hpp"

namespace qz::toolkit::qt {

namespace {

bool decidesWhatIsAControl(const QByteArray& property) {
  return property == tagProperty || property == panelProperty;
}

}  // namespace

TreeWatch::TreeWatch() { QCoreApplication::instance()->installEventFilter(this); }

bool TreeWatch::eventFilter(QObject*, QEvent* event) {
  switch (event->type()) {
    case QEvent::ChildAdded:
    case QEvent::ChildRemoved:
      hasChanged_ |= static_cast<const QChildEvent*>(event)->child()->isWidgetType();
      break;
    case QEvent::DynamicPropertyChange:
      hasChanged_ |= decidesWhatIsAControl(
          static_cast<const QDynamicPropertyChangeEvent*>(event)->propertyName());
      break;
    case QEvent::WinIdChange:   // also when a widget becomes a window, or no longer is one
    case QEvent::ZOrderChange:  // also when a stack gets a page that is its child already
    case QEvent::ActionAdded:
    case QEvent::ActionChanged:  // an action that gets a menu is no longer a control
    case QEvent::ActionRemoved:
      hasChanged_ = true;
      break;
    default:
      break;
  }
  return false;
}

}  // namespace qz::toolkit::qt
