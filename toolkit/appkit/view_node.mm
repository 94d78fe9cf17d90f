// SPDX-License-Identifier: MIT
// Presents the tree of `NSView`s as a tree of views. AppKit owns the objects.

#import "toolkit/appkit/view_node.hpp"

#include <algorithm>
#include <utility>

#include "qz/toolkit/exception.hpp"
#import "toolkit/appkit/calling.hpp"
#import "toolkit/appkit/layer.hpp"
#include "toolkit/backend/insertion.hpp"
#import "toolkit/foundation/strings.hpp"

namespace qz::toolkit::appkit {

namespace {

// A box holds its subviews in a view of its own.
NSView* holderIn(NSView* view) {
  return [view isKindOfClass:[NSBox class]] ? [static_cast<NSBox*>(view) contentView] : view;
}

NSView* superviewOf(NSView* view) {
  NSView* const around = [view superview];
  NSView* const box = [around superview];
  return box && holderIn(box) == around ? box : around;
}

// Returns the subviews that are a host's or a script's, back to front.
NSArray* shownSubviewsOf(NSView* view) {
  NSMutableArray* const shown = [NSMutableArray array];
  NSEnumerator* const all = [[holderIn(view) subviews] objectEnumerator];
  while (NSView* const each = [all nextObject]) {
    if (!isLayer(each)) [shown addObject:each];
  }
  return shown;
}

bool present(const Subviews& views, NSArray* objects) {
  NSUInteger index = 0;
  return views.size() == [objects count] &&
         std::all_of(views.begin(), views.end(), [&](const Ref<View>& view) {
           return ViewNode::of(view)->object() == [objects objectAtIndex:index++];
         });
}

}  // namespace

ViewNode::ViewNode(NSView* view, std::shared_ptr<Desk> desk)
    : desk_(std::move(desk)), object_(view) {}

ViewNode::~ViewNode() {
  const foundation::Pool pool;
  desk_->forget(object());
  object_ = {};
}

std::shared_ptr<ViewNode> ViewNode::of(const Ref<View>& view) {
  return std::dynamic_pointer_cast<ViewNode>(view.pointer());
}

Ref<View> ViewNode::view() { return std::shared_ptr<View>(shared_from_this(), &role()); }

std::string ViewNode::nameOfClass() const {
  const foundation::Pool pool;
  return foundation::utf8(NSStringFromClass([object() class]));
}

void ViewNode::writeTag(Tag tag) {
  if (![object() respondsToSelector:@selector(setTag:)]) {
    raiseUnrecognizedSelector(nameOfClass(), "setTag:");
  }
  calling([&] { [static_cast<NSControl*>(object()) setTag:tag]; });
}

Rect ViewNode::readFrame() const {
  const NSRect frame = [object() frame];
  if (placement_ && NSEqualRects(placement_->got, frame)) return placement_->asked;
  return {frame.origin.x, frame.origin.y, frame.size.width, frame.size.height};
}

void ViewNode::place(const Rect& frame) {
  calling([&] { [object() setFrame:NSMakeRect(frame.x, frame.y, frame.width, frame.height)]; });
  placement_ = Placement{frame, [object() frame]};
}

const Subviews& ViewNode::readSubviews() {
  const foundation::Pool pool;
  NSArray* const shown = shownSubviewsOf(object());
  if (present(subviews_, shown)) return subviews_;
  Subviews fresh;
  for (NSUInteger i = 0; i < [shown count]; ++i) {
    fresh.push_back(desk_->nodeOf([shown objectAtIndex:i])->view());
  }
  subviews_.swap(fresh);
  return subviews_;
}

void ViewNode::insert(const Ref<View>& view) {
  const auto node = of(view);
  requireOwnView(nameOfClass(), view, node != nullptr);
  NSView* const added = node->object();
  requireFreeView(nameOfClass(), [[added window] contentView] == added,
                  added == object() || [object() isDescendantOf:added]);
  // The reference may be an element of the list that the view now leaves.
  // NOLINTNEXTLINE(performance-unnecessary-copy-initialization)
  const Ref<View> kept = view;
  const auto before = of(node->superview());
  calling([&] {
    [added retain];
    [added removeFromSuperview];
    [holderIn(object()) addSubview:added];
    [added release];
  });
  // The whole list is not read anew, which would take longer with every view. What a host has
  // changed, the next reading sees.
  if (before) std::erase(before->subviews_, kept);
  subviews_.push_back(kept);
}

void ViewNode::removeFromSuperview() {
  const foundation::Pool pool;
  const auto kept = shared_from_this();
  const auto around = of(superview());
  [object() removeFromSuperview];
  if (around) std::erase(around->subviews_, view());
}

Ref<View> ViewNode::superview() const {
  NSView* const around = superviewOf(object());
  // The superview of a content view is a part of the window's frame.
  if (!around || [[object() window] contentView] == object()) return {};
  return desk_->nodeOf(around)->view();
}

void ViewNode::showToolTip(std::string_view text) {
  [object() setToolTip:text.empty() ? nil : foundation::nsString(text)];
}

void ViewNode::useLayer(bool wants) {
  wantsLayer_ = wants;
  if (!wants) layerContents_ = nullptr;
  setLayered(object(), wants);
}

void ViewNode::showInLayer(const Ref<Image>& image) {
  if (!wantsLayer_) return;
  layerContents_ = image;
  showLayerContents(object(), image);
}

}  // namespace qz::toolkit::appkit
