// SPDX-License-Identifier: MIT
// Acts as a user through Qt's own events, and reads what the widgets show.

#include "drivers/qt/qt_driver.hpp"

#include <QApplication>
#include <QCheckBox>
#include <QEventLoop>
#include <QGroupBox>
#include <QLabel>
#include <QMouseEvent>
#include <QPushButton>
#include <QStyleOptionButton>
#include <QTimer>
#include <QToolButton>
#include <QWindow>
#include <algorithm>
#include <chrono>
#include <clocale>
#include <cmath>
#include <utility>

#include "qz/drivers/qt/toolkit_row.hpp"
#include "toolkit/qt/accessibility.hpp"
#include "toolkit/qt/button_look.hpp"
#include "toolkit/qt/parts.hpp"
#include "toolkit/qt/strings.hpp"
#include "toolkit/qt/text_look.hpp"
#include "toolkit/qt/views.hpp"
#include "toolkit/qt/window.hpp"
#include "toolkit/qt/window_look.hpp"

namespace qz::drivers {

namespace {

template <class W>
QWidget* plain() {
  return new W;
}

QWidget* pushButton() { return new QPushButton("Button"); }

QWidget* toggle() { return new QCheckBox("Button"); }

QWidget* threeStates() {
  auto* const button = new QCheckBox("Button");
  button->setTristate(true);
  return button;
}

QWidget* textField() {
  auto* const label = new QLabel;
  layOutAsTextField(*label);
  return label;
}

QWidget* imageView() {
  auto* const label = new QLabel;
  label->setProperty(imageViewProperty, true);
  return label;
}

// Opens no menu; the arrow only marks the kind of button.
QWidget* popUpButton() {
  auto* const button = new QToolButton;
  button->setArrowType(Qt::DownArrow);
  button->setToolButtonStyle(Qt::ToolButtonTextBesideIcon);
  return button;
}

// How a kind of view is made.
struct QtKind {
  ViewKind kind;
  std::string_view className;
  QWidget* (*make)();
};

constexpr QtKind qtKinds[] = {
    {ViewKind::button, "QPushButton", pushButton},
    {ViewKind::toggle, "QCheckBox", toggle},
    {ViewKind::mixed, "QCheckBox", threeStates},
    {ViewKind::popUpButton, "QToolButton", popUpButton},
    {ViewKind::textField, "QLabel", textField},
    {ViewKind::imageView, "QLabel", imageView},
    {ViewKind::box, "QGroupBox", plain<QGroupBox>},
    {ViewKind::plain, "QWidget", plain<QWidget>},
};

static_assert(hasOneRowForEachKind(qtKinds));

ViewKind kindOf(const QAbstractButton& button) {
  const auto* const box = qobject_cast<const QCheckBox*>(&button);
  if (box && box->isTristate()) return ViewKind::mixed;
  if (button.isCheckable()) return ViewKind::toggle;
  return qobject_cast<const QToolButton*>(&button) ? ViewKind::popUpButton : ViewKind::button;
}

ViewKind kindOf(View& view, const QWidget& widget) {
  if (view.asButton()) return kindOf(static_cast<const QAbstractButton&>(widget));
  if (view.asTextField()) return ViewKind::textField;
  if (view.asImageView()) return ViewKind::imageView;
  return qobject_cast<const QGroupBox*>(&widget) ? ViewKind::box : ViewKind::plain;
}

// Shows windows on a display if one can be reached; otherwise they are drawn off the screen. Tries
// X11 before Wayland, where a sheet cannot be positioned.
void chooseDisplay() {
#ifdef Q_OS_LINUX
  if (!qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) return;
  QByteArray platforms;
  if (!qEnvironmentVariableIsEmpty("DISPLAY")) platforms += "xcb;";
  if (!qEnvironmentVariableIsEmpty("WAYLAND_DISPLAY")) platforms += "wayland;";
  qputenv("QT_QPA_PLATFORM", platforms + "offscreen");
#endif
}

// Never destroyed: drivers come and go, but Qt allows only one application per program run.
void requireApplication() {
  if (QCoreApplication::instance()) return;
  chooseDisplay();
  static int argc = 1;
  static char name[] = "qz-walkthrough";
  static char* argv[] = {name, nullptr};
  [[maybe_unused]] static const auto* const application = new QApplication(argc, argv);
  QApplication::setQuitOnLastWindowClosed(false);
  std::setlocale(LC_NUMERIC, "C");  // Qt sets the user's, which may have decimal commas
}

// True if a modal window blocks `window`. Qt then blocks real input, but not events that are sent
// to the window's widgets.
bool isBlocked(const QWidget& window) {
  const auto all = QGuiApplication::topLevelWindows();
  return std::any_of(all.begin(), all.end(), [&](const QWindow* modal) {
    if (!modal->isVisible() || modal->modality() == Qt::NonModal) return false;
    const QWindow* const own = window.windowHandle();
    if (modal->modality() == Qt::ApplicationModal) return modal != own;
    for (const QWindow* above = modal->transientParent(); above; above = above->transientParent()) {
      if (above == own) return true;
    }
    return false;
  });
}

// A check box accepts clicks only on its indicator and text, not on the space next to them.
QPoint whereToClick(const QWidget& widget) {
  QStyleOptionButton option;
  option.initFrom(&widget);
  if (qobject_cast<const QCheckBox*>(&widget)) {
    return widget.style()->subElementRect(QStyle::SE_CheckBoxIndicator, &option, &widget).center();
  }
  return widget.rect().center();
}

constexpr QPoint outside(-1, -1);

void sendMouse(QWidget& widget, QEvent::Type type, Qt::MouseButtons held, QPointF local) {
  QMouseEvent event(type, local, widget.mapTo(widget.window(), local), widget.mapToGlobal(local),
                    Qt::LeftButton, held, Qt::NoModifier);
  QCoreApplication::sendEvent(&widget, &event);
}

void press(QWidget& widget) {
  sendMouse(widget, QEvent::MouseButtonPress, Qt::LeftButton, whereToClick(widget));
}

// Releases the mouse button; has no effect on a widget that is hidden or behind a modal window.
void release(QWidget& widget) {
  const bool arrives = widget.isVisible() && !isBlocked(*widget.window());
  const QPointF place = arrives ? whereToClick(widget) : outside;
  sendMouse(widget, QEvent::MouseButtonRelease, Qt::NoButton, place);
}

// For a click while the mouse button is down elsewhere. Only buttons react.
void clickByKeyboard(QWidget& widget) {
  if (auto* const button = qobject_cast<QAbstractButton*>(&widget)) button->click();
}

}  // namespace

template class PacedDriver<QtToolkit>;

DeletionSweep::~DeletionSweep() {
  QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

Ref<Window> QtDriver::makeWindow(const Rect& content) {
  auto window = QtWindow::make(content, StyleMask::titledAndClosable, toolkit_.application().desk(),
                               KeptBy::holder);
  window->makeKeyAndOrderFront();
  return window;
}

Ref<View> QtDriver::makeView(ViewKind kind, Tag tag, const Rect& frame, const Ref<View>& parent) {
  const auto node =
      qt::makeView(*rowOf(qtKinds, kind).make(), toolkit_.application().desk(), KeptBy::holder);
  node->place(frame);
  Ref<View> view = node->view();
  view->setTag(tag);
  parent->addSubview(view);
  return view;
}

void QtDriver::removeFromSuperview(const Ref<View>& view) {
  if (const auto node = WidgetNode::of(view)) node->removeFromSuperview();
}

void QtDriver::setFrame(const Ref<View>& view, const Rect& frame) {
  if (const auto node = WidgetNode::of(view)) node->place(frame);
}

void QtDriver::setWindowTitle(const Ref<Window>& window, std::string_view title) {
  const auto shown = QtWindow::of(window);
  if (shown && shown->widget()) shown->widget()->setWindowTitle(qString(title));
}

std::string_view QtDriver::className(ViewKind kind) const { return rowOf(qtKinds, kind).className; }

void QtDriver::click(const Ref<View>& view) {
  settle();
  const auto node = WidgetNode::of(view);
  const QPointer<QWidget> widget = node ? node->widget() : nullptr;
  if (!widget || !widget->isVisible() || isBlocked(*widget->window())) return;
  if (held_) {
    clickByKeyboard(*widget);
  } else {
    press(*widget);
    if (widget) release(*widget);
  }
  settle();
  raiseWhatWasThrown();
}

void QtDriver::hold(const Ref<View>& view) {
  letGo();
  settle();
  const auto node = WidgetNode::of(view);
  auto* const button = node ? qobject_cast<QAbstractButton*>(node->widget()) : nullptr;
  if (!button || !button->isVisible() || !button->isEnabled() || isBlocked(*button->window())) {
    return;
  }
  held_ = button;
  press(*button);
  settle();
  raiseWhatWasThrown();
}

void QtDriver::letGo() {
  if (const QPointer<QWidget> held = std::exchange(held_, nullptr)) release(*held);
  settle();
  toolkit_.parts().runLoop.wake();
  settle();
  raiseWhatWasThrown();
}

void QtDriver::awaitEvents(double seconds) {
  constexpr double longestWait = 3600;
  // The loop waits for events; this timer is the one that ends the wait.
  QTimer end;
  end.setTimerType(Qt::PreciseTimer);
  end.callOnTimeout([] {});
  end.start(
      std::chrono::milliseconds(std::lround(std::ceil(std::min(seconds, longestWait) * 1000))));
  QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
}

// Processes posted events, pending repaints and pending deletions.
void QtDriver::settle() {
  QCoreApplication::processEvents();
  QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

// What is looked at is one moment: while a person acts, a timer that is due must not fire in it.
void QtDriver::settleWithoutFiring() {
  {
    const PacedClock::Going still(clock_, 0);
    settle();
  }
  toolkit_.parts().runLoop.setAlarm();
}

ViewPicture QtDriver::look(const Ref<View>& view) {
  ViewPicture picture;
  const auto node = WidgetNode::of(view);
  if (!node || !node->widget()) return picture;
  const QWidget& widget = *node->widget();
  picture.kind = kindOf(*view, widget);
  picture.className = view->className();
  picture.tag = view->tag();
  picture.frame = view->frame();
  picture.hidden = node->isHidden();
  picture.enabled = widget.isEnabledTo(widget.parentWidget());
  picture.state = view->state();
  picture.toolTip = shownToolTip(widget);
  if (const auto* control = dynamic_cast<const ControlNode*>(node.get())) {
    picture.text = control->value();
    picture.target = control->target();
    if (!control->action().empty()) picture.action = control->action();
  }
  if (const auto* button = qobject_cast<const QAbstractButton*>(&widget)) {
    picture.highlighted = isHighlighted(*button);
    picture.title = shownTitle(*button);
    picture.background = faceColor(*button);
  }
  if (const auto* imageView = dynamic_cast<const QtImageView*>(node.get())) {
    picture.image = nameOf(imageView->image());
  }
  return picture;
}

WindowPicture QtDriver::look(const Ref<Window>& window) {
  WindowPicture picture;
  settleWithoutFiring();
  const auto shown = QtWindow::of(window);
  if (!shown || !shown->widget()) return picture;
  const QWidget& widget = *shown->widget();
  picture.visible = widget.isVisible();
  picture.key = widget.isActiveWindow();
  picture.closes = shown->closes();
  picture.content = shown->content();
  const auto flags = widget.windowFlags();
  if (flags & Qt::WindowTitleHint) picture.style |= static_cast<unsigned>(StyleMask::titled);
  if (flags & Qt::WindowCloseButtonHint) {
    picture.style |= static_cast<unsigned>(StyleMask::closable);
  }
  picture.background = windowColor(widget);
  picture.delegate = shown->delegate();
  if (const auto content = WidgetNode::of(shown->contentView())) {
    picture.layered = isLayered(*content->widget());
    picture.layerImage = nameOf(layerContents(*content->widget()));
  }
  picture.sheetOf = shown->sheetParent();
  picture.sheetEnds = shown->sheetEnds();
  return picture;
}

std::unique_ptr<Driver> makeQtDriver() {
  requireApplication();
  return std::make_unique<QtDriver>();
}

}  // namespace qz::drivers
