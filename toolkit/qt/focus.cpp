// SPDX-License-Identifier: MIT
// Qt looks for the next widget only in active windows, and only when it hides a widget itself.

#include "toolkit/qt/focus.hpp"

#include <QWidget>

namespace qz::toolkit::qt {

namespace {

bool isWithin(const QWidget* inner, const QWidget& outer) {
  return inner == &outer || outer.isAncestorOf(inner);
}

}  // namespace

bool takesFocus(const QWidget& widget) {
  return (widget.focusPolicy() & Qt::TabFocus) == Qt::TabFocus && widget.isEnabled() &&
         widget.isVisibleTo(widget.window()) && !widget.isWindow();
}

void giveFocusAway(QWidget& widget) {
  QWidget* const focused = widget.window()->focusWidget();
  if (!focused || !isWithin(focused, widget)) return;
  for (QWidget* next = focused->nextInFocusChain(); next != focused;
       next = next->nextInFocusChain()) {
    if (!takesFocus(*next) || isWithin(next, widget)) continue;
    return next->setFocus(Qt::OtherFocusReason);
  }
  focused->clearFocus();
}

}  // namespace qz::toolkit::qt
