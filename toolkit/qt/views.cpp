// SPDX-License-Identifier: MIT
// The kinds of view: chooses the kind, sends actions, shows contents.

#include "toolkit/qt/views.hpp"

#include <QAction>
#include <QCheckBox>
#include <QMenu>
#include <QToolButton>
#include <QVariant>

#include "toolkit/backend/responder_chain.hpp"
#include "toolkit/qt/button_look.hpp"
#include "toolkit/qt/check_state.hpp"
#include "toolkit/qt/hiding.hpp"
#include "toolkit/qt/input_widgets.hpp"
#include "toolkit/qt/text_look.hpp"
#include "toolkit/qt/window.hpp"

namespace qz::toolkit::qt {

namespace {

bool isImageView(const QWidget& widget) {
  const auto* const label = qobject_cast<const QLabel*>(&widget);
  return label && (widget.property(imageViewProperty).toBool() ||
                   !label->pixmap(Qt::ReturnByValue).isNull());
}

// True if a press of the button goes to the host as well as to the target.
bool servesBoth(const QAbstractButton& button) {
  const auto* const tool = qobject_cast<const QToolButton*>(&button);
  const QAction* const action = tool ? tool->defaultAction() : nullptr;
  return isMarkedForBoth(button) || (action && isMarkedForBoth(*action));
}

template <class V>
std::shared_ptr<WidgetNode> make(QWidget& widget, const std::shared_ptr<Desk>& desk,
                                 KeptBy keptBy) {
  const auto view = std::make_shared<V>(widget, desk, keptBy);
  desk->enter(widget, view);
  return view;
}

}  // namespace

std::shared_ptr<WidgetNode> makeView(QWidget& widget, const std::shared_ptr<Desk>& desk,
                                     KeptBy keptBy) {
  if (qobject_cast<QAbstractButton*>(&widget)) return make<QtButton>(widget, desk, keptBy);
  if (isImageView(widget)) return make<QtImageView>(widget, desk, keptBy);
  if (showsText(widget)) return make<QtTextField>(widget, desk, keptBy);
  return make<QtOtherView>(widget, desk, keptBy);
}

bool ControlNode::send(std::string_view action, const std::shared_ptr<Responder>& target) {
  const QPointer<QWidget> top = widget() ? widget()->window() : nullptr;
  return sendAlongResponderChain(
      action, target, view(),
      {[](const Ref<View>& view) { return of(view)->superview(); },
       [desk = desk_, top]() -> Ref<Window> { return top ? desk->knownWindow(*top) : nullptr; }});
}

QtButton::~QtButton() { QObject::disconnect(clicks_); }

void QtButton::takeClicks() {
  if (!button() || gate_) return;
  if (!servesBoth(*button())) {
    takeMenuEntries();
    heldAction_ = std::make_unique<HeldAction>(*button());
  }
  gate_ = std::make_unique<PressGate>(
      *button(), [this] { return takesPress(); }, [this] { clicked(); });
}

// In a form the menus that show the button's action, and its shortcut, press the button.
void QtButton::takeMenuEntries() {
  QAction* const action = isInForm() ? actionShownBy(*button()) : nullptr;
  if (!action || action->menu()) return;
  menuEntries_ = std::make_unique<ActionStandIn>(*action, [this](bool) {
    if (button()) button()->click();
  });
}

// Asked at each press: the host may mark the button at any time, and the target may be gone.
bool QtButton::takesPress() const { return target() && !servesBoth(*button()); }

void QtButton::hearClicks() {
  if (!button() || clicks_) return;
  clicks_ = QObject::connect(button(), &QAbstractButton::clicked, [this] { clicked(); });
}

void QtButton::clicked() {
  const Ref<View> kept = view();  // the action may release it
  qt::setHighlighted(*button(), false);
  if (desk_->willAct) desk_->willAct(kept);
  desk_->calls.make([this] { send(action_, target()); });
}

void QtButton::setTitle(std::string_view title) {
  const auto noted = change(Aspect::contents, Notice::shown);
  if (button()) showTitle(*button(), title);
  changed();
}

std::optional<AttributedString> QtButton::attributedTitle() const {
  if (!button()) return std::nullopt;
  return shownTitle(*button());
}

void QtButton::setAttributedTitle(const AttributedString& title) {
  const auto noted = change(Aspect::contents, Notice::shown);
  if (button()) showTitle(*button(), title);
  changed();
}

State QtButton::state() const {
  if (!button()) return State::off;
  return button()->isCheckable() ? checkState(*button()) : heldState_;
}

void QtButton::setState(State state) {
  if (!button()) return;
  const auto noted = change(Aspect::contents, Notice::shown);
  if (button()->isCheckable()) {
    setCheckState(*button(), state);
  } else {
    heldState_ = state == State::mixed ? State::on : state;
  }
  changed();
}

bool QtButton::isHighlighted() const { return button() && qt::isHighlighted(*button()); }

void QtButton::highlight(bool highlighted) {
  const auto noted = change(Aspect::contents, highlighted ? Notice::flash : Notice::none);
  if (button()) qt::setHighlighted(*button(), highlighted);
  changed();
}

void QtButton::setBackgroundColor(const Color& color) {
  const auto noted = change(Aspect::contents, Notice::shown);
  if (button()) setFaceColor(*button(), color);
  changed();
}

// Only for buttons that the engine makes, so nothing is restored.
void QtButton::setBezelStyle(BezelStyle style) {
  if (button()) setBezel(*button(), style);
  changed();
}

AttributedString QtTextField::value() const {
  return widget() ? shownText(*widget()) : AttributedString();
}

void QtTextField::setValue(const AttributedString& value) { showText(*widget(), value); }

// Asked each time, because a host may make a group box checkable later.
void QtOtherView::setEnabled(bool enabled) {
  if (widget_ && !takesInput(*widget_)) return View::setEnabled(enabled);
  const auto noted = change(Aspect::enabled);
  enable(enabled);
}

void QtImageView::setImage(const Ref<Image>& image) {
  const auto noted = change(Aspect::contents, Notice::shown);
  if (label()) showImage(*label(), image);
  changed();
}

Ref<Image> QtImageView::image() const { return label() ? shownImage(*label()) : Ref<Image>(); }

}  // namespace qz::toolkit::qt
