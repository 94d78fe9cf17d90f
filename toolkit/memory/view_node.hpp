// SPDX-License-Identifier: MIT
// The base of all views of the memory toolkit: the view tree, and the visible properties that all
// views share. `MemoryView` combines it with a role.
//
// Invariants: a view has at most one superview, which owns it, and never lies within itself; a
// content view has no superview.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>

#include "qz/toolkit/class_names.hpp"
#include "qz/toolkit/geometry.hpp"
#include "qz/toolkit/image.hpp"
#include "qz/toolkit/view.hpp"
#include "toolkit/memory/saved_view.hpp"
#include "toolkit/memory/screen.hpp"

namespace qz::toolkit::memory {

class MemoryWindow;

class ViewNode : public std::enable_shared_from_this<ViewNode> {
 public:
  ViewNode(std::string_view className, const Rect& frame, const std::shared_ptr<Screen>& screen);
  virtual ~ViewNode() = default;
  ViewNode(const ViewNode&) = delete;
  ViewNode& operator=(const ViewNode&) = delete;

  /// Returns the node of `view`; null if it is absent or belongs to another toolkit.
  static std::shared_ptr<ViewNode> of(const Ref<View>& view);
  /// Returns the view of this node.
  Ref<View> view();

  bool isHidden() const { return hidden_; }
  const std::string& toolTip() const { return toolTip_; }
  bool wantsLayer() const { return wantsLayer_; }
  /// Returns the image that the layer shows; absent without a layer.
  const Ref<Image>& layerContents() const { return layerContents_; }
  void setFrame(const Rect& frame) { change(frame_, frame); }

  /// Returns what the view shows now; `restore` shows it again, in this view or another of its
  /// kind. A view without a role ignores the fields of that role.
  virtual SavedView save() const;
  virtual void restore(const SavedView& saved);

  std::shared_ptr<ViewNode> superview() const { return superview_.lock(); }
  /// Returns the window that contains the view at any depth, or null.
  std::shared_ptr<MemoryWindow> window() const;
  void becomeContentViewOf(const std::shared_ptr<MemoryWindow>& window) { window_ = window; }
  /// Removes the view from its superview, if it has one; this may destroy the view.
  void removeFromSuperview();
  /// Whether a click reaches the view: neither it nor a view around it is hidden, and its window
  /// accepts input.
  bool takesInput() const;

 protected:
  virtual View& role() = 0;

  /// Adds `view` in front of the subviews and removes it from its previous superview. Raises an
  /// invalid-argument exception and changes nothing if `view` is absent, belongs to another
  /// toolkit, is a window's content view, or is this view or one around it.
  void insert(const Ref<View>& view);
  /// Sets a visible field.
  template <class Field, class Value>
  void change(Field& field, const Value& value) {
    field = value;
    changed();
  }
  /// Records that a visible property has changed.
  void changed();
  bool isRedrawPending() const;

  std::string className_;
  Tag tag_ = 0;  // the default of a new view
  Rect frame_;
  bool hidden_ = false;
  std::string toolTip_;
  bool wantsLayer_ = false;
  Ref<Image> layerContents_;
  Subviews subviews_;  // owned

 private:
  bool isWithin(const ViewNode& view) const;

  std::weak_ptr<ViewNode> superview_;   // owns this view, unless its maker does
  std::weak_ptr<MemoryWindow> window_;  // of a content view only; owns it
  std::weak_ptr<const Screen> screen_;  // owned by the application
  std::uint64_t changedAt_ = 0;         // the number of redraws at the last change
};

}  // namespace qz::toolkit::memory
