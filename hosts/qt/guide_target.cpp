// SPDX-License-Identifier: MIT
// Finds controls through the toolkit, as commands do.

#include "hosts/qt/guide_target.hpp"

#include <QEvent>
#include <QWidget>

#include "toolkit/qt/action_view.hpp"
#include "toolkit/qt/strings.hpp"
#include "toolkit/qt/widget_node.hpp"

namespace qz::hosts::qt {

namespace {

// That of an action is the menu bar or the button whose menus have it.
QWidget* widgetOf(const toolkit::Ref<toolkit::View>& view) {
  if (const auto action = toolkit::qt::QtAction::of(view)) return action->place();
  return toolkit::qt::WidgetNode::of(view)->widget();
}

QWidget* controlWithTag(toolkit::Tag tag, toolkit::qt::QtToolkit& toolkit, QWidget& form,
                        const QWidget& panel) {
  const auto window = toolkit.application().window(form);
  const auto content = window->contentView();
  for (const auto& view : content->subviews()) {
    if (view->tag() != tag) continue;
    QWidget* const widget = widgetOf(view);
    if (widget && !panel.isAncestorOf(widget)) return widget;
  }
  return nullptr;
}

bool isMove(QEvent::Type type) {
  return type == QEvent::Move || type == QEvent::Resize || type == QEvent::Show ||
         type == QEvent::Hide || type == QEvent::ParentChange ||
         type == QEvent::WindowStateChange || type == QEvent::LayoutDirectionChange ||
         type == QEvent::FontChange;
}

}  // namespace

Pointing controlMeantBy(const QString& text, toolkit::qt::QtToolkit& toolkit, QWidget& form,
                        const QWidget& panel) {
  const QString words = text.trimmed();
  if (words.isEmpty()) return {};
  bool isTag = false;
  const toolkit::Tag tag = words.toLongLong(&isTag);
  const std::string meant = "The guide points at \"" + toolkit::qt::utf8(words) + "\", ";
  if (!isTag) return {nullptr, meant + "which is not a tag (a whole decimal number)"};
  QWidget* const control = controlWithTag(tag, toolkit, form, panel);
  return {control, control ? "" : meant + "but no control of the form has this tag"};
}

void bringControlIntoView(toolkit::qt::QtToolkit& toolkit, QWidget& control) {
  toolkit::qt::WidgetNode::of(toolkit.application().view(control))->comeIntoView();
}

QRect visiblePartOf(const QWidget& widget) {
  QRect part = widget.isVisible() ? widget.rect() : QRect();
  for (const QWidget* inner = &widget; !inner->isWindow(); inner = inner->parentWidget()) {
    part = part.translated(inner->pos()) & inner->parentWidget()->rect();
  }
  return part;
}

void Follower::leaveAll() {
  for (const auto& watched : watched_) {
    if (!watched) continue;
    watched->removeEventFilter(this);
    watched->disconnect(this);
  }
  watched_.clear();
}

void Follower::follow(QWidget* widget) {
  leaveAll();
  widget_ = widget;
  for (; widget; widget = widget->isWindow() ? nullptr : widget->parentWidget()) {
    widget->installEventFilter(this);
    connect(widget, &QObject::destroyed, this, [this] { moved_(); });
    watched_.emplace_back(widget);
  }
}

bool Follower::eventFilter(QObject*, QEvent* event) {
  if (!isMove(event->type())) return false;
  if (event->type() == QEvent::ParentChange) follow(widget_);
  moved_();
  return false;
}

}  // namespace qz::hosts::qt
