// SPDX-License-Identifier: MIT
// Shows a walk-through's changes in the action itself, so that everything that shows it follows.

#include "toolkit/qt/action_view.hpp"

#include <QActionGroup>
#include <QMenu>
#include <utility>

#include "toolkit/backend/insertion.hpp"
#include "toolkit/backend/responder_chain.hpp"
#include "toolkit/qt/action_facets.hpp"
#include "toolkit/qt/mnemonics.hpp"
#include "toolkit/qt/strings.hpp"
#include "toolkit/qt/widget_node.hpp"
#include "toolkit/qt/window.hpp"

namespace qz::toolkit::qt {

namespace {

// Follows the menus up to what opens the first of them.
QWidget* opener(const QAction& shown) {
  for (QObject* const object : shown.associatedObjects()) {
    const auto* const menu = qobject_cast<QMenu*>(object);
    auto* const widget = menu ? opener(*menu->menuAction()) : qobject_cast<QWidget*>(object);
    if (widget) return widget;
  }
  return nullptr;
}

}  // namespace

QtAction::QtAction(QAction& action, std::shared_ptr<Desk> desk)
    : action_(&action),
      key_(&action),
      desk_(std::move(desk)),
      hadTag_(action.property(tagProperty).isValid()) {}

QtAction::~QtAction() {
  QObject::disconnect(triggers_);
  desk_->forgetAction(key_);
}

std::shared_ptr<QtAction> QtAction::of(const Ref<View>& view) {
  return std::dynamic_pointer_cast<QtAction>(view.pointer());
}

QWidget* QtAction::place() const {
  if (!action_) return nullptr;
  return opener(standIn_ && standIn_->shown() ? *standIn_->shown() : *action_);
}

void QtAction::joinForm(const std::shared_ptr<AdoptedForm>& form, Tag tag) {
  form_ = form;
  givenTag_ = tag;
}

ViewChange QtAction::change() { return {action_, form_.lock()}; }

std::string QtAction::className() const {
  return action_ ? action_->metaObject()->className() : "";
}

Tag QtAction::tag() const {
  if (!action_) return 0;
  const QVariant own = action_->property(tagProperty);
  return own.isValid() ? Tag{own.toLongLong()} : givenTag_;
}

void QtAction::setTag(Tag tag) {
  if (!action_) return;
  const auto noted = change();
  const bool leavesNothing = tag == givenTag_ && !hadTag_;
  action_->setProperty(tagProperty,
                       leavesNothing ? QVariant() : QVariant(static_cast<qlonglong>(tag)));
}

const Subviews& QtAction::subviews() const {
  static const Subviews none;
  return none;
}

void QtAction::addSubview(const Ref<View>& view) { requireOwnView(className(), view, false); }

void QtAction::setHidden(bool hidden) {
  const auto noted = change();
  if (action_) action_->setVisible(!hidden);
}

void QtAction::setToolTip(std::string_view text) {
  const auto noted = change();
  if (action_) action_->setToolTip(qString(text));
}

void QtAction::setEnabled(bool enabled) {
  const auto noted = change();
  if (action_) action_->setEnabled(enabled);
}

// A press of an action that is marked for both, or that has no target, reaches the host first. The
// mark must be there before the target.
void QtAction::setTarget(const std::shared_ptr<Responder>& target) {
  target_ = target;
  if (action_ && target && !standIn_ && !isMarkedForBoth(*action_)) {
    standIn_ = std::make_unique<ActionStandIn>(*action_, [this](bool on) { pressed(on); });
  }
  hearTriggers();
}

void QtAction::setAction(std::string_view action) {
  message_ = action;
  hearTriggers();
}

void QtAction::hearTriggers() {
  if (!action_ || triggers_) return;
  triggers_ = QObject::connect(action_, &QAction::triggered, [this] {
    if (!standIn_) send();
  });
}

void QtAction::pressed(bool on) {
  if (target_.expired()) return action_->trigger();
  if (action_->isCheckable()) action_->setChecked(on);
  send();
}

void QtAction::send() {
  const Ref<View> kept(shared_from_this());  // the press may release it
  if (desk_->willAct) desk_->willAct(kept);
  desk_->calls.make([this] { sendAction(message_, target_.lock()); });
}

bool QtAction::sendAction(std::string_view action, const std::shared_ptr<Responder>& target) {
  if (!action_) return false;
  const QPointer<QWidget> around = place();
  return sendAlongResponderChain(action, target, Ref<View>(shared_from_this()),
                                 {[](const Ref<View>&) { return Ref<View>(); },
                                  [desk = desk_, around]() -> Ref<Window> {
                                    return around ? desk->knownWindow(*around->window()) : nullptr;
                                  }});
}

void QtAction::setTitle(std::string_view title) {
  const auto noted = change();
  if (action_) action_->setText(withoutMeaning(qString(title)));
}

std::optional<AttributedString> QtAction::attributedTitle() const {
  if (!action_) return std::nullopt;
  return AttributedString(utf8(withoutMnemonic(action_->text())));
}

State QtAction::state() const {
  if (!action_ || !action_->isCheckable()) return heldState_;
  return action_->isChecked() ? State::on : State::off;
}

void QtAction::setState(State state) {
  const auto noted = change();
  heldState_ = state == State::mixed ? State::on : state;
  if (action_ && action_->isCheckable()) action_->setChecked(heldState_ == State::on);
}

}  // namespace qz::toolkit::qt
