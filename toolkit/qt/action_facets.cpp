// SPDX-License-Identifier: MIT
// Reads and restores the facets of actions. A text or tooltip that Qt takes from another text of
// the action is not set: it would no longer follow.

#include "toolkit/qt/action_facets.hpp"

#include <QAction>
#include <QActionGroup>
#include <QPointer>

#include "toolkit/qt/widget_node.hpp"

namespace qz::toolkit::qt {

namespace {

QAction& asAction(QObject& object) { return static_cast<QAction&>(object); }

QVariant readActionTag(QObject& object) { return QVariantList{object.property(tagProperty)}; }
void writeActionTag(QObject& object, const QVariant& value) {
  object.setProperty(tagProperty, value.toList().front());
}

QVariant readActionText(QObject& object) { return asAction(object).text(); }
void writeActionText(QObject& object, const QVariant& value) {
  asAction(object).setText({});
  if (readActionText(object) != value) asAction(object).setText(value.toString());
}

QVariant readActionToolTip(QObject& object) { return asAction(object).toolTip(); }
void writeActionToolTip(QObject& object, const QVariant& value) {
  asAction(object).setToolTip({});
  if (readActionToolTip(object) != value) asAction(object).setToolTip(value.toString());
}

QVariant readActionVisible(QObject& object) { return asAction(object).isVisible(); }
void writeActionVisible(QObject& object, const QVariant& value) {
  asAction(object).setVisible(value.toBool());
}

// An action that is not visible is not enabled either.
QVariant readActionEnabled(QObject& object) {
  const QAction& action = asAction(object);
  return action.isVisible() ? action.isEnabled() : QVariant();
}
void writeActionEnabled(QObject& object, const QVariant& value) {
  QAction& action = asAction(object);
  if (action.isEnabled() != value.toBool()) action.setEnabled(value.toBool());
}

QActionGroup* choiceOf(const QAction& action) {
  QActionGroup* const group = action.actionGroup();
  return group && group->isExclusive() ? group : nullptr;
}

using PickedAction = QPointer<QAction>;

// That of an action of which only one in a group can be on is the choice.
QVariant readActionCheck(QObject& object) {
  const QActionGroup* const group = choiceOf(asAction(object));
  if (group) return QVariant::fromValue(PickedAction(group->checkedAction()));
  return asAction(object).isChecked();
}

void writeActionCheck(QObject& object, const QVariant& value) {
  const QActionGroup* const group = choiceOf(asAction(object));
  if (!group) return asAction(object).setChecked(value.toBool());
  QAction* const chosen = value.value<PickedAction>();
  QAction* const present = group->checkedAction();
  if (chosen) {
    chosen->setChecked(true);
  } else if (present) {
    present->setChecked(false);
  }
}

}  // namespace

std::span<const Facet> actionFacets() {
  static constexpr Facet table[] = {
      {readActionTag, writeActionTag},         {readActionToolTip, writeActionToolTip},
      {readActionText, writeActionText},       {readActionCheck, writeActionCheck},
      {readActionEnabled, writeActionEnabled}, {readActionVisible, writeActionVisible},
  };
  return table;
}

}  // namespace qz::toolkit::qt
