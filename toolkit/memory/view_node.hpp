// SPDX-License-Identifier: MIT
// What all views of the memory toolkit have in common, whatever their role: the tree that they make
// and what shows of them. `MemoryView` joins it to a role.
//
// Invariants: a view lies in at most one superview, which owns it, and never within itself; a
// content view lies in none.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>

#include "toolkit/geometry.hpp"
#include "toolkit/image.hpp"
#include "toolkit/memory/screen.hpp"
#include "toolkit/view.hpp"

namespace toolkit::memory {

class MemoryWindow;

/// The class names that views of this toolkit report: AppKit's.
namespace class_names {
inline constexpr std::string_view box = "NSBox";
inline constexpr std::string_view button = "NSButton";
inline constexpr std::string_view imageView = "NSImageView";
inline constexpr std::string_view popUpButton = "NSPopUpButton";
inline constexpr std::string_view textField = "NSTextField";
inline constexpr std::string_view view = "NSView";
}  // namespace class_names

class ViewNode : public std::enable_shared_from_this<ViewNode> {
 public:
  ViewNode(std::string_view className, const Rect& frame, const std::shared_ptr<Screen>& screen);
  virtual ~ViewNode() = default;
  ViewNode(const ViewNode&) = delete;
  ViewNode& operator=(const ViewNode&) = delete;

  /// The node of `view`; null when it is absent or another toolkit's.
  static std::shared_ptr<ViewNode> of(const Ref<View>& view);
  /// The view that this is the node of.
  Ref<View> view();

  bool isHidden() const { return hidden_; }
  const std::string& toolTip() const { return toolTip_; }
  bool wantsLayer() const { return wantsLayer_; }
  /// What its layer shows; absent without a layer.
  const Ref<Image>& layerContents() const { return layerContents_; }
  void setFrame(const Rect& frame) { change(frame_, frame); }

  std::shared_ptr<ViewNode> superview() const { return superview_.lock(); }
  /// The window in which it lies, however deep, or null.
  std::shared_ptr<MemoryWindow> window() const;
  void becomeContentViewOf(const std::shared_ptr<MemoryWindow>& window) { window_ = window; }
  /// Takes it out of its superview, if it is in one; that may be its end.
  void removeFromSuperview();
  /// Whether a click on it arrives: neither it nor anything around it is hidden, and its window
  /// takes input.
  bool takesInput() const;

 protected:
  virtual View& role() = 0;

  /// Puts `view` in front of the subviews, taking it from where it was. Raises an invalid-argument
  /// exception, changing nothing, when it is absent, another toolkit's, a window's content view, or
  /// this view or one around it.
  void insert(const Ref<View>& view);
  /// Sets one of the fields that show.
  template <class Field, class Value>
  void change(Field& field, const Value& value) {
    field = value;
    changed();
  }
  /// Something that shows has changed.
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

  std::weak_ptr<ViewNode> superview_;   // its own superview's, or maker's
  std::weak_ptr<MemoryWindow> window_;  // of a content view only; its owner
  std::weak_ptr<const Screen> screen_;  // the application's
  std::uint64_t changedAt_ = 0;         // how many drawings there had been
};

}  // namespace toolkit::memory
