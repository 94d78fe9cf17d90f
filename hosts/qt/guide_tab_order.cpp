// SPDX-License-Identifier: MIT
// The widget with the focus gets the key first, so that one is watched.

#include "hosts/qt/guide_tab_order.hpp"

#include <QAbstractItemView>
#include <QApplication>
#include <QKeyEvent>
#include <QPlainTextEdit>
#include <QTextEdit>

#include "hosts/qt/guide_panel.hpp"
#include "toolkit/qt/focus.hpp"

namespace qz::hosts::qt {

namespace {

template <class Edit>
bool takesTabAsText(const QWidget& widget) {
  const auto* const edit = qobject_cast<const Edit*>(&widget);
  return edit && !edit->tabChangesFocus() && !edit->isReadOnly();
}

bool usesTabItself(const QWidget& widget) {
  const auto* const items = qobject_cast<const QAbstractItemView*>(&widget);
  return takesTabAsText<QTextEdit>(widget) || takesTabAsText<QPlainTextEdit>(widget) ||
         (items && items->tabKeyNavigation());
}

bool isTab(const QKeyEvent& key) {
  return !(key.modifiers() & (Qt::ControlModifier | Qt::AltModifier)) &&
         (key.key() == Qt::Key_Tab || key.key() == Qt::Key_Backtab);
}

bool isForward(const QKeyEvent& key) {
  return key.key() == Qt::Key_Tab && !(key.modifiers() & Qt::ShiftModifier);
}

// Returns null if the Tab key reaches nothing else.
QWidget* nextStop(const QWidget& from, QWidget* (QWidget::*step)() const) {
  for (QWidget* place = (from.*step)(); place != &from; place = (place->*step)()) {
    if (toolkit::qt::takesFocus(*place)) return place;
  }
  return nullptr;
}

bool isAt(const QWidget& focused, const QWidget* place) {
  return place && (place == &focused || place->isAncestorOf(&focused));
}

}  // namespace

GuideTabOrder::GuideTabOrder(QWidget& form, GuidePanel& panel) : form_(&form), panel_(&panel) {
  panel.leave = [this](bool next) { return leave(next); };
  connect(qApp, &QApplication::focusChanged, this,
          [this](QWidget*, QWidget* now) { listenTo(now); });
  listenTo(QApplication::focusWidget());
}

void GuideTabOrder::listenTo(QWidget* focused) {
  if (focused_) focused_->removeEventFilter(this);
  const bool isInForm =
      focused && form_ && panel_ && focused->window() == form_ && !panel_->isAncestorOf(focused);
  focused_ = isInForm ? focused : nullptr;
  if (focused_) focused_->installEventFilter(this);
}

bool GuideTabOrder::eventFilter(QObject*, QEvent* event) {
  if (event->type() != QEvent::KeyPress || !panel_ || !panel_->isVisible()) return false;
  const auto& key = *static_cast<QKeyEvent*>(event);
  if (!isTab(key) || usesTabItself(*focused_)) return false;
  if (!isAt(*focused_, isForward(key) ? before() : after())) return false;
  panel_->focus(isForward(key));
  return true;
}

bool GuideTabOrder::leave(bool next) {
  QWidget* const place = !form_ ? nullptr : next ? after() : before();
  if (!place) return false;
  place->window()->activateWindow();
  place->setFocus(next ? Qt::TabFocusReason : Qt::BacktabFocusReason);
  return true;
}

QWidget* GuideTabOrder::before() const {
  QWidget* const start = target_ ? target_.data() : form_->focusWidget();
  if (!start || toolkit::qt::takesFocus(*start)) return start;
  return nextStop(*start, &QWidget::previousInFocusChain);
}

QWidget* GuideTabOrder::after() const {
  QWidget* const start = before();
  return nextStop(start ? *start : *form_, &QWidget::nextInFocusChain);
}

}  // namespace qz::hosts::qt
