// SPDX-License-Identifier: MIT
// Finds the actions of tool bars and menus, and hides them.

#include "toolkit/qt/hiding.hpp"

#include <QAction>
#include <QMenu>
#include <QStackedWidget>
#include <QTabWidget>
#include <QToolBar>
#include <algorithm>

namespace qz::toolkit::qt {

namespace {

// Returns the action whose visibility is that of the widget; null if the widget has its own.
QAction* visibilityOf(const QWidget& widget) {
  const auto* const menu = qobject_cast<const QMenu*>(&widget);
  return menu ? menu->menuAction() : actionShownBy(widget);
}

// Returns the tab widget of which the widget is a page; null if it is none.
QTabWidget* tabsOf(const QWidget& widget) {
  const auto* const stack = qobject_cast<const QStackedWidget*>(widget.parentWidget());
  return stack ? qobject_cast<QTabWidget*>(stack->parentWidget()) : nullptr;
}

}  // namespace

QAction* actionShownBy(const QWidget& widget) {
  const auto* const bar = qobject_cast<const QToolBar*>(widget.parentWidget());
  if (!bar) return nullptr;
  const auto actions = bar->actions();
  const auto found = std::find_if(actions.begin(), actions.end(), [&](QAction* action) {
    return bar->widgetForAction(action) == &widget;
  });
  return found == actions.end() ? nullptr : *found;
}

bool isHiddenInForm(const QWidget& widget) {
  if (const auto* const tabs = tabsOf(widget))
    return !tabs->isTabVisible(tabs->indexOf(&const_cast<QWidget&>(widget)));
  const QAction* const action = visibilityOf(widget);
  return action ? !action->isVisible() : widget.isHidden();
}

void setHiddenInForm(QWidget& widget, bool hidden) {
  if (auto* const tabs = tabsOf(widget))
    return tabs->setTabVisible(tabs->indexOf(&widget), !hidden);
  if (QAction* const action = visibilityOf(widget)) return action->setVisible(!hidden);
  widget.setHidden(hidden);
}

}  // namespace qz::toolkit::qt
