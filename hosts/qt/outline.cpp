// SPDX-License-Identifier: MIT
#include "hosts/qt/outline.hpp"

#include <QWidget>

#include "toolkit/qt/widget_node.hpp"

namespace qz::hosts::qt {

namespace {

ControlOutline::Kind outlinedKind(toolkit::View& view) {
  using Kind = ControlOutline::Kind;
  if (view.asButton()) return Kind::button;
  if (view.asTextField()) return Kind::textField;
  return view.asImageView() ? Kind::imageView : Kind::other;
}

// A control in a group that is disabled can still be enabled itself, which commands change.
ControlOutline outlineOf(const toolkit::Ref<toolkit::View>& view) {
  const auto node = toolkit::qt::WidgetNode::of(view);
  const QWidget* const widget = node->widget();
  return {.kind = outlinedKind(*view),
          .tag = view->tag(),
          .isHidden = node->isHidden(),
          .isEnabled = !widget || widget->isEnabledTo(widget->parentWidget())};
}

}  // namespace

WindowOutline outlineOf(const QZ_Plist_State_Parser& engine) {
  WindowOutline outline;
  for (const auto& view : engine.tutorialWindow()->contentView()->subviews()) {
    outline.controls.push_back(outlineOf(view));
  }
  const auto timers = engine.objectIdTimers();
  for (const auto& [key, timer] : timers->entries()) outline.timers.push_back(key);
  return outline;
}

}  // namespace qz::hosts::qt
