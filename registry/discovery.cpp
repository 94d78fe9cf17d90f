// SPDX-License-Identifier: MIT
// Discovery: adopts a window, connects its buttons and records its controls.

#include <algorithm>

#include "engine/state.hpp"
#include "engine/tag_key.hpp"

namespace qz {

namespace {

constexpr auto buttonAction = "buttonPushed:";

bool isRecorded(toolkit::View& view) {
  return view.asButton() || view.asImageView() || view.asTextField();
}

AssetRecord recordOf(const toolkit::Ref<toolkit::View>& view) {
  const toolkit::Rect frame = view->frame();
  return {{view->className()},
          {static_cast<float>(frame.x), static_cast<float>(frame.y),
           static_cast<float>(frame.width), static_cast<float>(frame.height)},
          toolkit::StoredRef<toolkit::View>::refer(view)};
}

// Returns the first key that no tag uses: one more than the largest tag, where a negative one
// counts as 0.
std::uint64_t firstOverflowKey(const toolkit::Subviews& views) {
  toolkit::Tag largest = 0;
  for (const auto& view : views) largest = std::max(largest, view->tag());
  return static_cast<std::uint64_t>(largest) + 1;
}

}  // namespace

bool QZ_Plist_State_Parser::getGuiAssetsFromWindow(Window window) {
  if (const auto other = state_->overridden("getGuiAssetsFromWindow:", window)) return other->yes;
  const auto kept = keepAlive();
  if (!window) return false;
  // A window that the engine already keeps alive stays so.
  if (tutorialWindow() != window) {
    state_->tutorialWindow.set(toolkit::StoredRef<toolkit::Window>::refer(window));
  }
  if (!window->delegate()) window->setDelegate(shared_from_this());
  state_->guiAssets->removeAllObjects();
  state_->originalTagValues->removeAllObjects();
  const Control content = window->contentView();
  const toolkit::Subviews views = content->subviews();  // a copy: it may change during the loop
  std::uint64_t overflowKey = firstOverflowKey(views);
  bool recorded = false;
  for (const Control& view : views) {
    if (!isRecorded(*view)) continue;
    if (const auto button = toolkit::asButton(view)) {
      button->setTarget(shared_from_this());
      button->setAction(buttonAction);
    }
    const std::string own = tagKey(view->tag());
    const std::string key = state_->guiAssets->contains(own) ? std::to_string(overflowKey++) : own;
    state_->guiAssets->setObject(recordOf(view), key);
    state_->originalTagValues->setObject(toolkit::Number::withLong(view->tag()), key);
    state_->toolkit.log().write("Found tag value: " + own + " for object: " + view->className() +
                                " using Key: " + key);
    recorded = true;
  }
  return recorded;
}

bool QZ_Plist_State_Parser::forceButtonPushedToBeActionForGuiAttribute(Control object) {
  const auto kept = keepAlive();
  if (!object || !(object->asButton() || object->asGradient())) return false;
  object->setAction(buttonAction);  // the target stays
  return true;
}

}  // namespace qz
