// SPDX-License-Identifier: MIT
// The Qt toolkit's views and controls: implements the roles of toolkit/view.hpp with a host's
// widgets.
//
// A class inherits from both a role and a node: `QtView` implements what all views share,
// `QtControl` what all controls share, and each kind adds only its own part.
#pragma once

#include <QAbstractButton>
#include <QLabel>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

#include "qz/toolkit/view.hpp"
#include "toolkit/qt/accessibility.hpp"
#include "toolkit/qt/action_stand_in.hpp"
#include "toolkit/qt/held_action.hpp"
#include "toolkit/qt/image_look.hpp"
#include "toolkit/qt/press_gate.hpp"
#include "toolkit/qt/widget_node.hpp"

namespace qz::toolkit::qt {

/// Makes the view of `widget`: a button for a `QAbstractButton`; an image view for a label that
/// shows a pixmap or is marked as one; a text field for a label, a line edit, a text edit or a
/// plain text edit; a plain view for anything else, even a combo box. The kind never changes while
/// the view lives.
std::shared_ptr<WidgetNode> makeView(QWidget& widget, const std::shared_ptr<Desk>& desk,
                                     KeptBy keptBy);

/// What all controls have in common, whatever their role.
class ControlNode : public WidgetNode {
 public:
  using WidgetNode::WidgetNode;

  /// The target; null if there is none or it is gone.
  std::shared_ptr<Responder> target() const { return target_.lock(); }
  /// The action; empty if there is none.
  const std::string& action() const { return action_; }
  /// The value that the control shows; a control that shows none only stores it.
  virtual AttributedString value() const { return value_; }

 protected:
  virtual void setValue(const AttributedString& value) { value_ = value; }
  /// As `Control::sendAction`; an empty action is not performed.
  bool send(std::string_view action, const std::shared_ptr<Responder>& target);

  std::weak_ptr<Responder> target_;  // owned by the code that made it
  std::string action_;

 private:
  AttributedString value_;
};

template <class Role, class Node = WidgetNode>
class QtView : public Role, public Node {
 public:
  using Node::Node;

  std::string className() const final { return this->nameOfClass(); }
  Tag tag() const final { return this->readTag(); }
  void setTag(Tag tag) final {
    const auto noted = this->change(Aspect::tag);
    this->writeTag(tag);
  }
  Rect frame() const final { return this->readFrame(); }
  // The list is read from the widgets, which do not report changes.
  const Subviews& subviews() const final { return const_cast<QtView*>(this)->readSubviews(); }
  void addSubview(const Ref<View>& view) final { this->insert(view); }
  bool needsDisplay() const final { return this->isRedrawPending(); }
  void setHidden(bool hidden) final {
    const auto noted = this->change(Aspect::hidden, hidden ? Notice::none : Notice::shown);
    this->hide(hidden);
  }

  void setToolTip(std::string_view text) final {
    const auto noted = this->change(Aspect::contents);
    if (this->widget_) showToolTip(*this->widget_, text);
  }
  void setWantsLayer(bool wants) final {
    const auto noted = this->change(Aspect::layer);
    if (this->widget_) setLayered(*this->widget_, wants);
    this->changed();
  }
  void setLayerContents(const Ref<Image>& image) final {
    const auto noted = this->change(Aspect::layer);
    if (this->widget_) showLayerContents(*this->widget_, image);
    this->changed();
  }

 protected:
  View& role() final { return *this; }
};

template <class Role>
class QtControl : public QtView<Role, ControlNode> {
 public:
  using QtView<Role, ControlNode>::QtView;

  void setEnabled(bool enabled) final {
    const auto noted = this->change(Aspect::enabled);
    this->enable(enabled);
  }
  void setTarget(const std::shared_ptr<Responder>& target) final {
    this->target_ = target;
    if (target) takeClicks();
    hearClicks();
  }
  void setAction(std::string_view action) final {
    this->action_ = action;
    hearClicks();
  }
  bool sendAction(std::string_view action, const std::shared_ptr<Responder>& target) final {
    return this->widget_ && this->send(action, target);
  }
  std::string stringValue() const final { return this->value().string(); }
  void setStringValue(std::string_view text) final {
    setAttributedStringValue(AttributedString(std::string(text)));
  }
  void setAttributedStringValue(const AttributedString& text) final {
    if (!this->widget_) return;
    const auto noted = this->change(Aspect::contents, Notice::shown);
    this->setValue(text);
    this->changed();
  }

 protected:
  // Leads the clicks away from the host while there is a target.
  virtual void takeClicks() {}
  // Listens for clicks. An action without a target is sent in addition to the host's reaction.
  virtual void hearClicks() {}
};

class QtButton final : public QtControl<Button> {
 public:
  using QtControl::QtControl;
  ~QtButton() override;

  void setTitle(std::string_view title) override;
  std::optional<AttributedString> attributedTitle() const override;
  void setAttributedTitle(const AttributedString& title) override;
  State state() const override;
  void setState(State state) override;
  bool isHighlighted() const override;
  void highlight(bool highlighted) override;
  void setBackgroundColor(const Color& color) override;
  void setBezelStyle(BezelStyle style) override;

 private:
  QAbstractButton* button() const { return static_cast<QAbstractButton*>(widget()); }
  void takeClicks() override;
  void takeMenuEntries();
  void hearClicks() override;
  bool takesPress() const;
  void clicked();

  State heldState_ = State::off;  // for a button that is not checkable; it is not shown
  QMetaObject::Connection clicks_;
  std::unique_ptr<HeldAction> heldAction_;
  std::unique_ptr<ActionStandIn> menuEntries_;  // of the button's action
  std::unique_ptr<PressGate> gate_;
};

class QtTextField final : public QtControl<TextField> {
 public:
  using QtControl::QtControl;

  AttributedString value() const override;
  void setTitle(std::string_view title) override { setStringValue(title); }
  void setDelegate(const std::shared_ptr<Responder>& delegate) override { delegate_ = delegate; }
  std::shared_ptr<Responder> delegate() const { return delegate_.lock(); }

 private:
  void setValue(const AttributedString& value) override;

  std::weak_ptr<Responder> delegate_;  // owned by the code that made it
};

/// Any other view. It can be enabled and disabled if its widget takes input.
class QtOtherView final : public QtView<View> {
 public:
  using QtView::QtView;

  void setEnabled(bool enabled) override;
};

/// Shows its image as scripts require: no frame, centred, shrunk to fit. Other frames, scalings and
/// alignments are not supported.
class QtImageView final : public QtControl<ImageView> {
 public:
  using QtControl::QtControl;

  void setImage(const Ref<Image>& image) override;
  void setImageFrameStyle(ImageFrameStyle) override {}
  void setImageScaling(ImageScaling) override {}
  void setImageAlignment(ImageAlignment) override {}

  Ref<Image> image() const;

 private:
  QLabel* label() const { return static_cast<QLabel*>(widget()); }
};

}  // namespace qz::toolkit::qt
