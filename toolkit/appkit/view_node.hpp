// SPDX-License-Identifier: MIT
// What all views of the AppKit toolkit have in common, whatever their role: the `NSView` behind
// each. `AppKitView` joins a node to a role.
//
// Invariants: an `NSView` has one view at a time, which retains it. What the script has shown stays
// in it when the view ends.
#pragma once

#import <AppKit/AppKit.h>

#include <memory>
#include <optional>
#include <string>

#include "qz/toolkit/geometry.hpp"
#include "qz/toolkit/view.hpp"
#import "toolkit/appkit/desk.hpp"
#import "toolkit/foundation/kept.hpp"

namespace qz::toolkit::appkit {

class ViewNode : public std::enable_shared_from_this<ViewNode> {
 public:
  ViewNode(NSView* view, std::shared_ptr<Desk> desk);
  virtual ~ViewNode();
  ViewNode(const ViewNode&) = delete;
  ViewNode& operator=(const ViewNode&) = delete;

  /// Returns the node of `view`; null if it is absent or another toolkit's.
  static std::shared_ptr<ViewNode> of(const Ref<View>& view);
  /// Returns the view of this node.
  Ref<View> view();
  NSView* object() const { return object_.get(); }

  /// Moves the view to `frame` in its superview. The frame is remembered as it is until the host
  /// moves the view: AppKit allows no negative size.
  void place(const Rect& frame);
  void removeFromSuperview();
  bool isHidden() const { return [object() isHidden]; }
  /// Returns the superview; absent if there is none.
  Ref<View> superview() const;

  /// Whether the view draws through a layer, and the image that the layer shows.
  bool wantsLayer() const { return wantsLayer_; }
  const Ref<Image>& layerContents() const { return layerContents_; }

 protected:
  virtual View& role() = 0;

  std::string nameOfClass() const;
  Tag readTag() const { return [object() tag]; }
  void writeTag(Tag tag);
  Rect readFrame() const;
  const Subviews& readSubviews();
  /// As `View::addSubview`. Raises an invalid-argument exception, and changes nothing, if `view` is
  /// absent, another toolkit's, a window's content view, this view or one of its superviews.
  void insert(const Ref<View>& view);
  void showToolTip(std::string_view text);
  void useLayer(bool wants);
  void showInLayer(const Ref<Image>& image);

  std::shared_ptr<Desk> desk_;

 private:
  struct Placement {
    Rect asked;
    NSRect got;
  };

  foundation::Kept<NSView*> object_;
  std::optional<Placement> placement_;
  Subviews subviews_;
  bool wantsLayer_ = false;
  Ref<Image> layerContents_;
};

}  // namespace qz::toolkit::appkit
