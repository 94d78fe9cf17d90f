// SPDX-License-Identifier: MIT
// Qt looks for the next widget only in active windows, and only when it hides a widget itself.

#include "toolkit/qt/focus.hpp"

#include <QVariant>
#include <QWidget>

#include "toolkit/qt/widget_node.hpp"

namespace qz::toolkit::qt {

namespace {

bool isWithin(const QWidget* inner, const QWidget& outer) {
  return inner == &outer || outer.isAncestorOf(inner);
}

// Returns the panel in the window that the widget is in; null if there is none.
QWidget* panelAround(const QWidget& widget) {
  QWidget* around = widget.parentWidget();
  while (around && !around->property(panelProperty).toBool()) around = around->parentWidget();
  return around;
}

// A panel may keep its controls from the form's own order of the Tab key, so each that can be
// clicked will do.
void focusIn(QWidget& panel, const QWidget& except) {
  for (QWidget* const inner : panel.findChildren<QWidget*>()) {
    const bool takes = (inner->focusPolicy() & Qt::ClickFocus) && inner->isEnabled() &&
                       inner->isVisibleTo(&panel) && !isWithin(inner, except);
    if (takes) return inner->setFocus(Qt::OtherFocusReason);
  }
  panel.setFocus(Qt::OtherFocusReason);
}

}  // namespace

bool takesFocus(const QWidget& widget) {
  return (widget.focusPolicy() & Qt::TabFocus) == Qt::TabFocus && widget.isEnabled() &&
         widget.isVisibleTo(widget.window()) && !widget.isWindow();
}

void giveFocusAway(QWidget& widget) {
  QWidget* const focused = widget.window()->focusWidget();
  if (!focused || !isWithin(focused, widget)) return;
  if (QWidget* const panel = panelAround(widget)) return focusIn(*panel, widget);
  for (QWidget* next = focused->nextInFocusChain(); next != focused;
       next = next->nextInFocusChain()) {
    if (!takesFocus(*next) || isWithin(next, widget)) continue;
    return next->setFocus(Qt::OtherFocusReason);
  }
  focused->clearFocus();
}

}  // namespace qz::toolkit::qt
