// SPDX-License-Identifier: MIT
// The AppKit toolkit's views and controls: implements the roles of toolkit/view.hpp with `NSView`s.
//
// A class inherits from both a role and a node: `AppKitView` implements what all views share,
// `AppKitControl` what all controls share, and each kind adds only its own part. What AppKit raises
// becomes an exception of the toolkit.
#pragma once

#import <AppKit/AppKit.h>

#include <memory>
#include <optional>
#include <string>
#include <string_view>

#include "qz/toolkit/view.hpp"
#import "toolkit/appkit/attributed_text.hpp"
#import "toolkit/appkit/calling.hpp"
#import "toolkit/appkit/responders.hpp"
#import "toolkit/appkit/view_node.hpp"

namespace qz::toolkit::appkit {

/// Makes the view of `view`: a button for an `NSButton`, a text field for an `NSTextField`, an
/// image view for an `NSImageView`; for another `NSControl` a view that understands what all
/// controls do.
std::shared_ptr<ViewNode> makeView(NSView* view, const std::shared_ptr<Desk>& desk);

/// What all controls have in common, whatever their role.
class ControlNode : public ViewNode {
 public:
  using ViewNode::ViewNode;
  ~ControlNode() override;

  NSControl* control() const { return static_cast<NSControl*>(object()); }
  std::shared_ptr<Responder> target() const { return responderFor([control() target], desk_); }
  /// The action; empty if there is none.
  std::string action() const;
  /// The value that the control shows; a control that shows none only stores it.
  virtual AttributedString value() const { return value_; }

 protected:
  virtual void setValue(const AttributedString& value) { value_ = value; }
  void aim(const std::shared_ptr<Responder>& target);
  /// As `Control::sendAction`; an empty action is not performed.
  bool send(std::string_view action, const std::shared_ptr<Responder>& target);

  AttributedString value_;

 private:
  Stand target_;
};

template <class Role, class Node = ViewNode>
class AppKitView : public Role, public Node {
 public:
  using Node::Node;

  std::string className() const final { return this->nameOfClass(); }
  Tag tag() const final { return this->readTag(); }
  void setTag(Tag tag) final { this->writeTag(tag); }
  Rect frame() const final { return this->readFrame(); }
  // The list is read from AppKit, which does not report changes.
  const Subviews& subviews() const final { return const_cast<AppKitView*>(this)->readSubviews(); }
  void addSubview(const Ref<View>& view) final { this->insert(view); }
  bool needsDisplay() const final { return [this->object() needsDisplay]; }
  void setHidden(bool hidden) final {
    calling([&] { [this->object() setHidden:hidden]; });
  }
  void setToolTip(std::string_view text) final {
    calling([&] { this->showToolTip(text); });
  }
  void setWantsLayer(bool wants) final {
    calling([&] { this->useLayer(wants); });
  }
  void setLayerContents(const Ref<Image>& image) final {
    calling([&] { this->showInLayer(image); });
  }

 protected:
  View& role() final { return *this; }
};

template <class Role>
class AppKitControl : public AppKitView<Role, ControlNode> {
 public:
  using AppKitView<Role, ControlNode>::AppKitView;

  void setEnabled(bool enabled) final {
    calling([&] { [this->control() setEnabled:enabled]; });
  }
  void setTarget(const std::shared_ptr<Responder>& target) final { this->aim(target); }
  void setAction(std::string_view action) final {
    calling([&] { [this->control() setAction:selectorOf(action)]; });
  }
  bool sendAction(std::string_view action, const std::shared_ptr<Responder>& target) final {
    return this->send(action, target);
  }
  std::string stringValue() const final { return this->value().string(); }
  void setStringValue(std::string_view text) final {
    setAttributedStringValue(AttributedString(std::string(text)));
  }
  void setAttributedStringValue(const AttributedString& text) final {
    calling([&] { this->setValue(text); });
  }
};

class AppKitButton final : public AppKitControl<Button> {
 public:
  using AppKitControl::AppKitControl;

  void setTitle(std::string_view title) override;
  std::optional<AttributedString> attributedTitle() const override;
  void setAttributedTitle(const AttributedString& title) override;
  State state() const override;
  void setState(State state) override;
  bool isHighlighted() const override { return [[button() cell] isHighlighted]; }
  void highlight(bool highlighted) override;
  void setBackgroundColor(const Color& color) override;
  void setBezelStyle(BezelStyle style) override;

  /// The colour that was set, if any.
  const std::optional<Color>& backgroundColor() const { return background_; }

 private:
  NSButton* button() const { return static_cast<NSButton*>(object()); }
  TextLook look() const;
  void show(const AttributedString& title);
  bool showsState() const;
  bool isPopUp() const;
  NSString* shownTitle() const;

  // Of a push button, because GNUstep changes its state with every click.
  State heldState_ = static_cast<State>([button() state]);
  std::optional<AttributedString> title_;  // as it was set
  std::optional<Color> background_;
};

class AppKitTextField final : public AppKitControl<TextField> {
 public:
  using AppKitControl::AppKitControl;
  ~AppKitTextField() override;

  AttributedString value() const override;
  void setTitle(std::string_view title) override { setStringValue(title); }
  void setDelegate(const std::shared_ptr<Responder>& delegate) override;
  std::shared_ptr<Responder> delegate() const { return responderFor([field() delegate], desk_); }

 private:
  NSTextField* field() const { return static_cast<NSTextField*>(object()); }
  TextLook look() const;
  void setValue(const AttributedString& value) override;

  Stand delegate_;
};

class AppKitImageView final : public AppKitControl<ImageView> {
 public:
  using AppKitControl::AppKitControl;

  void setImage(const Ref<Image>& image) override;
  void setImageFrameStyle(ImageFrameStyle style) override;
  void setImageScaling(ImageScaling scaling) override;
  void setImageAlignment(ImageAlignment alignment) override;

  Ref<Image> image() const;

 private:
  NSImageView* imageView() const { return static_cast<NSImageView*>(object()); }

  Ref<Image> image_;  // as it was set
};

/// Any other control, such as a slider.
class AppKitOtherControl final : public AppKitView<View> {
 public:
  using AppKitView::AppKitView;

  void setEnabled(bool enabled) override;
  void setAction(std::string_view action) override;
  std::string stringValue() const override;
  void setStringValue(std::string_view text) override;
  void setAttributedStringValue(const AttributedString& text) override;

 private:
  NSControl* control() const { return static_cast<NSControl*>(object()); }
};

}  // namespace qz::toolkit::appkit
