// SPDX-License-Identifier: MIT
// Qt presents each widget as the child of its parent. Here a panel presents its parts itself, and
// the text, which is in the area, says that the panel is its parent.

#include "hosts/qt/guide_accessibility.hpp"

#include <QAccessible>
#include <QAccessibleWidget>

#include "hosts/qt/guide_panel.hpp"

namespace qz::hosts::qt {

namespace {

class AccessiblePanel final : public QAccessibleWidget {
 public:
  explicit AccessiblePanel(GuidePanel& panel)
      : QAccessibleWidget(&panel, QAccessible::Dialog), parts_{&panel.heading, &panel.text,
                                                               &panel.picture, &panel.progress,
                                                               &panel.target,  &panel.skip,
                                                               &panel.back,    &panel.next} {}

  int childCount() const override { return static_cast<int>(parts_.size()); }
  QAccessibleInterface* child(int index) const override {
    return QAccessible::queryAccessibleInterface(parts_.value(index));
  }
  int indexOfChild(const QAccessibleInterface* child) const override {
    return child ? static_cast<int>(parts_.indexOf(child->object())) : -1;
  }

 private:
  const QObjectList parts_;
};

class AccessibleText final : public QAccessibleWidget {
 public:
  explicit AccessibleText(GuidePanel& panel)
      : QAccessibleWidget(&panel.text, QAccessible::StaticText), panel_(panel) {}

  QAccessibleInterface* parent() const override {
    return QAccessible::queryAccessibleInterface(&panel_);
  }
  QString text(QAccessible::Text kind) const override {
    return kind == QAccessible::Name ? panel_.text.words() : QAccessibleWidget::text(kind);
  }

 private:
  GuidePanel& panel_;  // ends after its text
};

GuidePanel* panelWithText(const QObject& object) {
  QObject* around = object.parent();
  while (around && !dynamic_cast<GuidePanel*>(around)) around = around->parent();
  auto* const panel = dynamic_cast<GuidePanel*>(around);
  return panel && &panel->text == &object ? panel : nullptr;
}

QAccessibleInterface* makeInterface(const QString&, QObject* object) {
  if (auto* const panel = dynamic_cast<GuidePanel*>(object)) return new AccessiblePanel(*panel);
  const bool isLabel = dynamic_cast<GuideLabel*>(object);
  GuidePanel* const panel = isLabel ? panelWithText(*object) : nullptr;
  return panel ? new AccessibleText(*panel) : nullptr;
}

}  // namespace

void simplifyAccessiblePanels() { QAccessible::installFactory(makeInterface); }

}  // namespace qz::hosts::qt
