// SPDX-License-Identifier: MIT
// The memory toolkit's views and controls: the roles of toolkit/view.hpp on top of nodes that
// record everything.
//
// Classes inherit from both a role and a node: `MemoryView` implements the messages that every view
// understands, `MemoryControl` those of every control, and each kind adds only its own.
#pragma once

#include <memory>
#include <optional>
#include <string>
#include <string_view>

#include "qz/toolkit/view.hpp"
#include "toolkit/memory/view_node.hpp"

namespace qz::toolkit::memory {

/// The base of all controls, independent of their role.
class ControlNode : public ViewNode {
 public:
  using ViewNode::ViewNode;

  bool isEnabled() const { return enabled_; }
  /// Returns the target; null if there is none or it was destroyed.
  std::shared_ptr<Responder> target() const { return target_.lock(); }
  /// Returns the action; empty if there is none.
  const std::string& action() const { return action_; }
  const AttributedString& attributedStringValue() const { return text_; }

  SavedView save() const override;
  void restore(const SavedView& saved) override;

 protected:
  /// Like `Control::sendAction`; an empty action is not sent.
  bool send(std::string_view action, const std::shared_ptr<Responder>& target);

  bool enabled_ = true;
  std::weak_ptr<Responder> target_;  // kept alive by its owner
  std::string action_;
  AttributedString text_;
};

template <class Role, class Node = ViewNode>
class MemoryView : public Role, public Node {
 public:
  using Node::Node;

  std::string className() const final { return this->className_; }
  Tag tag() const final { return this->tag_; }
  void setTag(Tag tag) final { this->tag_ = tag; }
  Rect frame() const final { return this->frame_; }
  const Subviews& subviews() const final { return this->subviews_; }
  void addSubview(const Ref<View>& view) final { this->insert(view); }
  bool needsDisplay() const final { return this->isRedrawPending(); }
  void setToolTip(std::string_view text) final { this->toolTip_ = text; }

  void setHidden(bool hidden) final { this->change(this->hidden_, hidden); }
  void setWantsLayer(bool wants) final {
    if (!wants) this->layerContents_ = nullptr;
    this->change(this->wantsLayer_, wants);
  }
  void setLayerContents(const Ref<Image>& image) final {
    if (this->wantsLayer_) this->change(this->layerContents_, image);
  }

 protected:
  View& role() final { return *this; }
};

template <class Role>
class MemoryControl : public MemoryView<Role, ControlNode> {
 public:
  using MemoryView<Role, ControlNode>::MemoryView;

  void setEnabled(bool enabled) final { this->change(this->enabled_, enabled); }
  void setTarget(const std::shared_ptr<Responder>& target) final { this->target_ = target; }
  void setAction(std::string_view action) final { this->action_ = action; }
  bool sendAction(std::string_view action, const std::shared_ptr<Responder>& target) final {
    return this->send(action, target);
  }
  std::string stringValue() const final { return this->text_.string(); }
  void setStringValue(std::string_view text) final {
    setAttributedStringValue(AttributedString(std::string(text)));
  }
  void setAttributedStringValue(const AttributedString& text) final {
    this->change(this->text_, text);
  }
};

/// The effect of a click on a button's state: none (`push`, and `popUp`, which has its own class),
/// alternating on and off (`toggle`), or cycling through mixed, on and off (`mixed`).
enum class ButtonBehavior { push, toggle, mixed, popUp };

class MemoryButton final : public MemoryControl<Button> {
 public:
  /// Makes a button with the title "Button", as in AppKit; a pop-up button has no title.
  MemoryButton(ButtonBehavior behavior, const Rect& frame, const std::shared_ptr<Screen>& screen);

  void setTitle(std::string_view title) override {
    change(title_, AttributedString(std::string(title)));
  }
  std::optional<AttributedString> attributedTitle() const override { return title_; }
  void setAttributedTitle(const AttributedString& title) override { change(title_, title); }
  State state() const override { return state_; }
  void setState(State state) override;
  bool isHighlighted() const override { return highlighted_; }
  void highlight(bool highlighted) override { change(highlighted_, highlighted); }
  void setBackgroundColor(const Color& color) override { change(background_, color); }
  void setBezelStyle(BezelStyle style) override { change(bezel_, style); }

  SavedView save() const override;
  void restore(const SavedView& saved) override;

  ButtonBehavior behavior() const { return behavior_; }
  const std::optional<Color>& backgroundColor() const { return background_; }
  BezelStyle bezelStyle() const { return bezel_; }

  /// Whether the button reacts to the user's clicks: they reach it and it is enabled.
  bool takesClicks() const { return isEnabled() && takesInput(); }
  /// Handles a click of the user. Does nothing if the button is disabled or the click does not
  /// reach it. Otherwise ends the pressed-in look and changes the state, then sends the action.
  void click();

 private:
  State stateAfterClick() const;

  ButtonBehavior behavior_;
  AttributedString title_;
  State state_ = State::off;
  bool highlighted_ = false;
  std::optional<Color> background_;
  BezelStyle bezel_ = BezelStyle::rounded;
};

class MemoryTextField final : public MemoryControl<TextField> {
 public:
  MemoryTextField(const Rect& frame, const std::shared_ptr<Screen>& screen)
      : MemoryControl(class_names::textField, frame, screen) {}

  void setTitle(std::string_view title) override { setStringValue(title); }
  void setDelegate(const std::shared_ptr<Responder>& delegate) override { delegate_ = delegate; }
  std::shared_ptr<Responder> delegate() const { return delegate_.lock(); }

 private:
  std::weak_ptr<Responder> delegate_;  // kept alive by its owner
};

class MemoryImageView final : public MemoryControl<ImageView> {
 public:
  MemoryImageView(const Rect& frame, const std::shared_ptr<Screen>& screen)
      : MemoryControl(class_names::imageView, frame, screen) {}

  void setImage(const Ref<Image>& image) override { change(image_, image); }
  void setImageFrameStyle(ImageFrameStyle style) override { change(frameStyle_, style); }
  void setImageScaling(ImageScaling scaling) override { change(scaling_, scaling); }
  void setImageAlignment(ImageAlignment alignment) override { change(alignment_, alignment); }

  SavedView save() const override;
  void restore(const SavedView& saved) override;

  const Ref<Image>& image() const { return image_; }
  ImageFrameStyle imageFrameStyle() const { return frameStyle_; }
  ImageScaling imageScaling() const { return scaling_; }
  ImageAlignment imageAlignment() const { return alignment_; }

 private:
  Ref<Image> image_;
  ImageFrameStyle frameStyle_ = ImageFrameStyle::none;
  ImageScaling scaling_ = ImageScaling::proportionallyDown;
  ImageAlignment alignment_ = ImageAlignment::center;
};

}  // namespace qz::toolkit::memory
