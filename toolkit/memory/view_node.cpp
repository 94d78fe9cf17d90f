// SPDX-License-Identifier: MIT
// The tree of views, up to the window. Superviews own their subviews. The references upwards are
// weak: a superview or a window may be destroyed before its views.

#include "toolkit/memory/view_node.hpp"

#include <algorithm>

#include "toolkit/backend/insertion.hpp"
#include "toolkit/memory/window.hpp"

namespace qz::toolkit::memory {

ViewNode::ViewNode(std::string_view className, const Rect& frame,
                   const std::shared_ptr<Screen>& screen)
    : className_(className), frame_(frame), screen_(screen) {
  changed();
}

std::shared_ptr<ViewNode> ViewNode::of(const Ref<View>& view) {
  return std::dynamic_pointer_cast<ViewNode>(view.pointer());
}

SavedView ViewNode::save() const {
  return {.tag = tag_,
          .hidden = hidden_,
          .toolTip = toolTip_,
          .wantsLayer = wantsLayer_,
          .layerContents = layerContents_};
}

void ViewNode::restore(const SavedView& saved) {
  tag_ = saved.tag;
  hidden_ = saved.hidden;
  toolTip_ = saved.toolTip;
  wantsLayer_ = saved.wantsLayer;
  layerContents_ = saved.layerContents;
  changed();
}

Ref<View> ViewNode::view() { return std::shared_ptr<View>(shared_from_this(), &role()); }

std::shared_ptr<MemoryWindow> ViewNode::window() const {
  auto root = shared_from_this();
  while (const auto superview = root->superview()) root = superview;
  return root->window_.lock();
}

bool ViewNode::takesInput() const {
  for (auto view = shared_from_this(); view; view = view->superview()) {
    if (view->hidden_) return false;
  }
  const auto window = this->window();
  return window && window->takesInput();
}

bool ViewNode::isWithin(const ViewNode& view) const {
  for (auto around = shared_from_this(); around; around = around->superview()) {
    if (around.get() == &view) return true;
  }
  return false;
}

void ViewNode::insert(const Ref<View>& view) {
  const auto node = of(view);
  requireOwnView(className_, view, node != nullptr);
  requireFreeView(className_, !node->window_.expired(), isWithin(*node));

  node->removeFromSuperview();
  subviews_.push_back(node->view());  // `view` may refer into the list that the view has just left
  node->superview_ = weak_from_this();
  changed();
}

void ViewNode::removeFromSuperview() {
  const auto superview = this->superview();
  if (!superview) return;
  superview_.reset();
  Subviews& list = superview->subviews_;
  list.erase(std::find(list.begin(), list.end(), view()));  // this may destroy this view
  superview->changed();
}

void ViewNode::changed() {
  if (const auto screen = screen_.lock()) changedAt_ = screen->drawings();
}

// Compares counts, so that a redraw need not visit every view to mark it as drawn.
bool ViewNode::isRedrawPending() const {
  const auto screen = screen_.lock();
  return screen && changedAt_ == screen->drawings();
}

}  // namespace qz::toolkit::memory
