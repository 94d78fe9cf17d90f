// SPDX-License-Identifier: MIT
// Follows the mouse button through the application's events, and asks Qt for the rest.

#include "toolkit/qt/user_tracking.hpp"

#include <QAbstractScrollArea>
#include <QApplication>
#include <QMouseEvent>
#include <QWindow>
#include <algorithm>
#include <utility>

#include "toolkit/qt/input_widgets.hpp"

namespace qz::toolkit::qt {

namespace {

// The viewport of a scroll area receives the area's mouse events.
QWidget& ownerOf(QWidget& widget) {
  auto* const area = qobject_cast<QAbstractScrollArea*>(widget.parentWidget());
  return area && area->viewport() == &widget ? *area : widget;
}

bool isPress(const QMouseEvent& event) {
  return event.button() == Qt::LeftButton &&
         (event.type() == QEvent::MouseButtonPress || event.type() == QEvent::MouseButtonDblClick);
}

bool isApplicationModal(const QWindow* window) {
  return window->modality() == Qt::ApplicationModal && window->isVisible();
}

// The latest modal window may be window-modal, opened over an application-modal one.
bool runsModalSession() {
  const QWindow* const latest = QGuiApplication::modalWindow();
  if (!latest) return false;
  if (latest->modality() == Qt::ApplicationModal) return true;
  const auto all = QGuiApplication::topLevelWindows();
  return std::any_of(all.begin(), all.end(), isApplicationModal);
}

}  // namespace

UserTracking::UserTracking(std::function<void()> mayBeOver) : mayBeOver_(std::move(mayBeOver)) {
  QCoreApplication::instance()->installEventFilter(this);
}

bool UserTracking::userIsBusy() const {
  return holdsControl() || QApplication::activePopupWidget() || runsModalSession();
}

// After a drag, for example, a release may reach no widget. Qt still counts the release if it
// counted the press.
bool UserTracking::holdsControl() const {
  return held_ && held_->isVisible() &&
         (!isCountedByQt_ || QGuiApplication::mouseButtons().testFlag(Qt::LeftButton));
}

bool UserTracking::eventFilter(QObject* receiver, QEvent* event) {
  switch (event->type()) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonDblClick:
    case QEvent::MouseButtonRelease:
    case QEvent::MouseMove:
      follow(*receiver, static_cast<const QMouseEvent&>(*event));
      break;
    case QEvent::WindowDeactivate:
      if (held_ && receiver == held_->window()) letGo();
      break;
    case QEvent::Hide:
      if (receiver->isWidgetType() && static_cast<const QWidget*>(receiver)->isWindow()) {
        mayBeOver_();
      }
      break;
    default:
      break;
  }
  return false;
}

// A press that its first receiver ignores is sent again to the widgets around it. A release may get
// lost, so any later mouse event without the left button ends the hold.
void UserTracking::follow(QObject& receiver, const QMouseEvent& event) {
  if (isPress(event) && receiver.isWidgetType()) {
    QWidget& pressed = ownerOf(static_cast<QWidget&>(receiver));
    if (!pressed.isEnabled() || !takesInput(pressed)) return;
    held_ = &pressed;
    isCountedByQt_ = QGuiApplication::mouseButtons().testFlag(Qt::LeftButton);
  } else if (!event.buttons().testFlag(Qt::LeftButton)) {
    letGo();
  }
}

void UserTracking::letGo() {
  if (!held_) return;
  held_ = nullptr;
  mayBeOver_();
}

}  // namespace qz::toolkit::qt
