// SPDX-License-Identifier: MIT
// An action emits nothing before `triggered`, so that nobody can keep the host from hearing it.
// Therefore menus show another action.

#include "toolkit/qt/action_stand_in.hpp"

#include <QMenu>
#include <QMenuBar>
#include <QMetaProperty>
#include <QShortcutEvent>
#include <QToolBar>
#include <QToolButton>
#include <utility>

namespace qz::toolkit::qt {

class ActionStandIn::Copy final : public QAction {
 public:
  explicit Copy(QAction& original) : original_(&original) {}
  QAction* original() const { return original_; }

 private:
  const QPointer<QAction> original_;
};

namespace {

void replace(QWidget& place, QAction& old, QAction& fresh) {
  auto* const menu = qobject_cast<QMenu*>(&place);
  const bool isDefault = menu && menu->defaultAction() == &old;
  place.insertAction(&old, &fresh);
  place.removeAction(&old);
  if (isDefault) menu->setDefaultAction(&fresh);
}

void replaceInMenus(QAction& old, QAction& fresh) {
  for (QObject* const object : old.associatedObjects()) {
    auto* const place = qobject_cast<QWidget*>(object);
    const bool isButton = qobject_cast<QToolBar*>(place) || qobject_cast<QToolButton*>(place);
    if (place && !isButton) replace(*place, old, fresh);
  }
}

// Returns the text with the shortcut in a menu's second column, as for an action that has it.
QString withShortcut(const QAction& action) {
  const QString keys = action.shortcut().toString(QKeySequence::NativeText);
  const bool hasColumn = action.text().contains('\t');
  return keys.isEmpty() || hasColumn ? action.text() : action.text() + '\t' + keys;
}

// Menus tell their host of every press in them and in the menus below. They are silent until the
// event loop goes on.
void silenceMenusOf(const QAction& action) {
  for (QObject* const object : action.associatedObjects()) {
    for (auto* around = qobject_cast<QWidget*>(object); around; around = around->parentWidget()) {
      const bool tells = qobject_cast<QMenu*>(around) || qobject_cast<QMenuBar*>(around);
      if (!tells || around->blockSignals(true)) continue;
      QMetaObject::invokeMethod(
          around, [around] { around->blockSignals(false); }, Qt::QueuedConnection);
    }
  }
}

}  // namespace

ActionStandIn::ActionStandIn(QAction& action, std::function<void(bool)> pressed)
    : action_(&action), copy_(new Copy(action)), pressed_(std::move(pressed)) {
  const QActionGroup* const group = action.actionGroup();
  if (group && group->isExclusive()) copy_->setActionGroup(&lone_);
  // Before those of the menus, which are silenced there.
  connect(copy_, &QAction::triggered, this, &ActionStandIn::triggered);
  replaceInMenus(action, *copy_);
  follow();
  action.installEventFilter(this);
  connect(&action, &QAction::changed, this, &ActionStandIn::follow);
  connect(&action, &QObject::destroyed, copy_, &QObject::deleteLater);
}

// Deletes the copy later, because this may run in its press.
ActionStandIn::~ActionStandIn() {
  if (!copy_) return;
  if (action_) replaceInMenus(*copy_, *action_);
  copy_->deleteLater();
}

QAction* ActionStandIn::actionBehind(QAction& shown) {
  auto* const copy = dynamic_cast<Copy*>(&shown);
  return copy ? copy->original() : &shown;
}

// A tool bar's action keeps its shortcuts; two actions with one are ambiguous.
void ActionStandIn::follow() {
  const QMetaObject& meta = QAction::staticMetaObject;
  for (int i = meta.propertyOffset(); i < meta.propertyCount(); ++i) {
    const QMetaProperty property = meta.property(i);
    if (property.typeId() != QMetaType::QKeySequence) property.write(copy_, property.read(action_));
  }
  copy_->setData(action_->data());
  if (action_->associatedObjects().isEmpty()) {
    copy_->setShortcuts(action_->shortcuts());
  } else {
    copy_->setText(withShortcut(*action_));
  }
}

bool ActionStandIn::eventFilter(QObject*, QEvent* event) {
  const bool isPress =
      event->type() == QEvent::Shortcut && !static_cast<QShortcutEvent*>(event)->isAmbiguous();
  if (isPress) triggered(action_->isCheckable() && !action_->isChecked());
  return isPress;
}

// A checkable copy has changed its state, but the receiver of the press decides whether the action
// changes, too.
void ActionStandIn::triggered(bool on) {
  if (!action_) return;
  follow();
  silenceMenusOf(*copy_);
  const auto pressed = pressed_;  // a copy: the press may end this object
  pressed(on);
}

}  // namespace qz::toolkit::qt
