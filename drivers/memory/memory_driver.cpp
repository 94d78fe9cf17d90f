// SPDX-License-Identifier: MIT
// Makes, moves and reads views and windows through this toolkit's classes, which also implement
// time and clicks.

#include "drivers/memory/memory_driver.hpp"

#include <utility>

#include "toolkit/memory/parts.hpp"
#include "toolkit/memory/views.hpp"
#include "toolkit/memory/window.hpp"

namespace qz::drivers {

namespace {

template <ButtonBehavior behavior>
std::shared_ptr<ViewNode> makeButton(const Rect& frame, const std::shared_ptr<Screen>& screen) {
  return std::make_shared<MemoryButton>(behavior, frame, screen);
}

template <class Node>
std::shared_ptr<ViewNode> makeNode(const Rect& frame, const std::shared_ptr<Screen>& screen) {
  return std::make_shared<Node>(frame, screen);
}

template <ViewKind kind>
std::shared_ptr<ViewNode> makePlain(const Rect& frame, const std::shared_ptr<Screen>& screen) {
  return std::make_shared<MemoryView<View>>(rowOf(kind).className, frame, screen);
}

// How a kind of view is made. It is recognised by its class and, for a button, by the effect of a
// click.
struct MemoryKind {
  ViewKind kind;
  std::optional<ButtonBehavior> behavior;
  std::shared_ptr<ViewNode> (*make)(const Rect& frame, const std::shared_ptr<Screen>& screen);
};

constexpr MemoryKind memoryKinds[] = {
    {ViewKind::button, ButtonBehavior::push, makeButton<ButtonBehavior::push>},
    {ViewKind::toggle, ButtonBehavior::toggle, makeButton<ButtonBehavior::toggle>},
    {ViewKind::mixed, ButtonBehavior::mixed, makeButton<ButtonBehavior::mixed>},
    {ViewKind::popUpButton, ButtonBehavior::popUp, makeButton<ButtonBehavior::popUp>},
    {ViewKind::textField, std::nullopt, makeNode<MemoryTextField>},
    {ViewKind::imageView, std::nullopt, makeNode<MemoryImageView>},
    {ViewKind::box, std::nullopt, makePlain<ViewKind::box>},
    {ViewKind::plain, std::nullopt, makePlain<ViewKind::plain>},
};

static_assert(hasOneRowForEachKind(memoryKinds));

bool behavesAs(const MemoryKind& row, const MemoryButton* button) {
  return button ? row.behavior && *row.behavior == button->behavior() : !row.behavior;
}

// A view whose class is not in the table (a host's own class) counts as plain.
ViewKind kindOf(View& view) {
  const auto* const button = dynamic_cast<const MemoryButton*>(&view);
  for (const MemoryKind& row : memoryKinds) {
    if (rowOf(row.kind).className == view.className() && behavesAs(row, button)) return row.kind;
  }
  return ViewKind::plain;
}

std::optional<std::string> nameOf(const Ref<Image>& image) {
  return image ? std::optional(image->name()) : std::nullopt;
}

void describe(const ControlNode& control, ViewPicture& picture) {
  picture.enabled = control.isEnabled();
  picture.text = control.attributedStringValue();
  picture.target = control.target();
  if (!control.action().empty()) picture.action = control.action();
}

void describe(const MemoryButton& button, ViewPicture& picture) {
  picture.highlighted = button.isHighlighted();
  picture.title = *button.attributedTitle();
  picture.background = button.backgroundColor();
}

}  // namespace

Ref<Window> MemoryDriver::makeWindow(const Rect& content) {
  auto window = MemoryWindow::make(toolkit_.application().screen(), content,
                                   StyleMask::titledAndClosable, KeptBy::holder);
  window->makeKeyAndOrderFront();
  return window;
}

Ref<View> MemoryDriver::makeView(ViewKind kind, Tag tag, const Rect& frame,
                                 const Ref<View>& parent) {
  const auto node = rowOf(memoryKinds, kind).make(frame, toolkit_.application().screen());
  Ref<View> view = node->view();
  view->setTag(tag);
  parent->addSubview(view);
  return view;
}

void MemoryDriver::removeFromSuperview(const Ref<View>& view) {
  if (const auto node = ViewNode::of(view)) node->removeFromSuperview();
}

void MemoryDriver::setFrame(const Ref<View>& view, const Rect& frame) {
  if (const auto node = ViewNode::of(view)) node->setFrame(frame);
}

void MemoryDriver::setResourcePath(std::string_view path) {
  toolkit_.files().setResourcePath(path);
}

std::string_view MemoryDriver::className(ViewKind kind) const { return rowOf(kind).className; }

void MemoryDriver::click(const Ref<View>& view) {
  if (const auto button = std::dynamic_pointer_cast<MemoryButton>(view.pointer())) {
    if (button == held_.lock()) isDown_ = false;
    button->click();
  }
  toolkit_.application().screen()->draw();
}

void MemoryDriver::hold(const Ref<View>& view) {
  letGo();
  const auto button = std::dynamic_pointer_cast<MemoryButton>(view.pointer());
  if (!button || !button->takesClicks()) return;
  held_ = button;
  isDown_ = true;
  toolkit_.parts().runLoop.setUserIsBusy(true);
}

void MemoryDriver::letGo() {
  if (toolkit_.parts().runLoop.isInDefaultMode()) return;
  toolkit_.parts().runLoop.setUserIsBusy(false);
  const auto button = held_.lock();
  if (button && isDown_) button->click();
  advance(0);
}

void MemoryDriver::advance(double seconds) {
  const auto held = held_.lock();
  if (!held || !held->takesInput()) toolkit_.parts().runLoop.setUserIsBusy(false);
  toolkit_.parts().runLoop.advance(seconds);
  toolkit_.application().screen()->draw();
}

ViewPicture MemoryDriver::look(const Ref<View>& view) {
  ViewPicture picture;
  const auto node = ViewNode::of(view);
  if (!node) return picture;
  picture.kind = kindOf(*view);
  picture.className = view->className();
  picture.tag = view->tag();
  picture.frame = view->frame();
  picture.hidden = node->isHidden();
  picture.state = view->state();
  picture.toolTip = node->toolTip();
  if (const auto* control = dynamic_cast<const ControlNode*>(node.get())) {
    describe(*control, picture);
  }
  if (const auto* button = dynamic_cast<const MemoryButton*>(node.get())) {
    describe(*button, picture);
  }
  if (const auto* imageView = dynamic_cast<const MemoryImageView*>(node.get())) {
    picture.image = nameOf(imageView->image());
  }
  return picture;
}

WindowPicture MemoryDriver::look(const Ref<Window>& window) {
  WindowPicture picture;
  const auto shown = MemoryWindow::of(window);
  if (!shown) return picture;
  picture.visible = shown->isVisible();
  picture.key = shown->isKey();
  picture.closes = shown->closes();
  picture.content = shown->content();
  picture.style = static_cast<unsigned>(shown->style());
  picture.background = shown->backgroundColor();
  picture.delegate = shown->delegate();
  const auto content = ViewNode::of(shown->contentView());
  picture.layered = content->wantsLayer();
  picture.layerImage = nameOf(content->layerContents());
  picture.sheetOf = shown->sheetParent();
  picture.sheetEnds = shown->sheetEnds();
  return picture;
}

void MemoryDriver::setLogSink(std::function<void(std::string_view)> sink) {
  // Without a sink, lines are discarded rather than written to standard error.
  toolkit_.log().setSink(sink ? std::move(sink) : [](std::string_view) {});
}

std::unique_ptr<Driver> makeMemoryDriver() { return std::make_unique<MemoryDriver>(); }

}  // namespace qz::drivers
