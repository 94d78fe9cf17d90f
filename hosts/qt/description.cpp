// SPDX-License-Identifier: MIT
// A key that has its default value is left out. An empty title is not the default.

#include "hosts/qt/description.hpp"

#include <QAbstractButton>
#include <QCheckBox>
#include <QGroupBox>
#include <QToolButton>
#include <QWidget>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/scalars.hpp"
#include "qz/property_list/xml_writer.hpp"
#include "qz/toolkit/class_names.hpp"
#include "toolkit/qt/accessibility.hpp"
#include "toolkit/qt/button_look.hpp"
#include "toolkit/qt/coordinates.hpp"
#include "toolkit/qt/strings.hpp"
#include "toolkit/qt/views.hpp"
#include "toolkit/qt/window.hpp"

namespace qz::hosts::qt {

namespace {

using toolkit::Number;
using toolkit::String;
using toolkit::ValueRef;
using toolkit::qt::WidgetNode;
namespace class_names = toolkit::class_names;

/// A dictionary that is being written.
class Description {
 public:
  void add(std::string_view key, const ValueRef<>& value) {
    entries_.push_back({String::make(key), value});
  }
  void add(std::string_view key, const std::string& text) { add(key, String::make(text)); }
  void add(std::string_view key, const toolkit::Rect& rect) {
    std::vector<ValueRef<>> numbers;
    for (const double number : {rect.x, rect.y, rect.width, rect.height}) {
      const auto whole = static_cast<std::int64_t>(number);
      const bool isWhole = static_cast<double>(whole) == number;
      numbers.emplace_back(isWhole ? Number::withLong(whole) : Number::withDouble(number));
    }
    add(key, toolkit::Array::make(std::move(numbers)));
  }
  ValueRef<> value() { return toolkit::Dictionary::make(std::move(entries_)); }

 private:
  std::vector<toolkit::Dictionary::Entry> entries_;
};

std::string classOf(const QAbstractButton& button) {
  const std::string name(class_names::button);
  const auto* const box = qobject_cast<const QCheckBox*>(&button);
  if (box && box->isTristate()) return name + ":mixed";
  if (button.isCheckable()) return name + ":toggle";
  const bool isToolButton = qobject_cast<const QToolButton*>(&button);
  return isToolButton ? std::string(class_names::popUpButton) : name;
}

std::string classOf(toolkit::View& view, const QWidget& widget) {
  if (view.asButton()) return classOf(static_cast<const QAbstractButton&>(widget));
  if (view.asTextField()) return std::string(class_names::textField);
  if (view.asImageView()) return std::string(class_names::imageView);
  return std::string(qobject_cast<const QGroupBox*>(&widget) ? class_names::box
                                                             : class_names::view);
}

// The origin is the lower left corner of the content.
toolkit::Rect frameIn(const QWidget& content, const QWidget& widget) {
  const QPoint corner = content.mapFromGlobal(widget.mapToGlobal(QPoint()));
  return toolkit::qt::flipped(toolkit::qt::exactly({corner, widget.size()}), content.height());
}

void addCaption(Description& description, toolkit::View& view, const WidgetNode& node) {
  if (view.asButton()) {
    const auto& button = static_cast<const QAbstractButton&>(*node.widget());
    description.add("title", toolkit::qt::shownTitle(button).string());
  } else if (view.asTextField()) {
    description.add("title", view.stringValue());
  } else if (const auto* const shown = dynamic_cast<const toolkit::qt::QtImageView*>(&node)) {
    if (shown->image()) description.add("image", shown->image()->name());
  }
}

void addState(Description& description, const toolkit::View& view) {
  if (view.state() == toolkit::State::on) description.add("state", std::string("on"));
  if (view.state() == toolkit::State::mixed) description.add("state", std::string("mixed"));
}

ValueRef<> controlDescription(const toolkit::Ref<toolkit::View>& view, const QWidget& content) {
  const auto node = WidgetNode::of(view);
  const QWidget& widget = *node->widget();
  Description description;
  description.add("class", classOf(*view, widget));
  description.add("tag", Number::withLong(view->tag()));
  description.add("frame", frameIn(content, widget));
  addCaption(description, *view, *node);
  addState(description, *view);
  const bool isControl = view->asButton() || view->asTextField() || view->asImageView();
  const bool isEnabled = widget.isEnabledTo(widget.parentWidget());
  if (isControl && !isEnabled) description.add("enabled", Number::withBool(false));
  if (node->isHidden()) description.add("hidden", Number::withBool(true));
  const std::string toolTip = toolkit::qt::shownToolTip(widget);
  if (!toolTip.empty()) description.add("toolTip", toolTip);
  return description.value();
}

ValueRef<> windowDescription(const toolkit::qt::QtWindow& window) {
  Description description;
  description.add("class", std::string(class_names::window));
  description.add("frame", window.content());
  description.add("title", toolkit::qt::utf8(window.widget()->windowTitle()));
  return description.value();
}

}  // namespace

QByteArray descriptionOf(const toolkit::Ref<toolkit::Window>& window) {
  const auto content = window->contentView();
  const QWidget& area = *WidgetNode::of(content)->widget();
  std::vector<ValueRef<>> entries{windowDescription(*toolkit::qt::QtWindow::of(window))};
  for (const auto& view : content->subviews()) entries.push_back(controlDescription(view, area));
  const auto description = toolkit::Array::make(std::move(entries));
  return QByteArray::fromStdString(toolkit::writeXmlPropertyList(description));
}

}  // namespace qz::hosts::qt
