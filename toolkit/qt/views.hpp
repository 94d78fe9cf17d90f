// SPDX-License-Identifier: MIT
// The Qt toolkit's views and controls: the roles of toolkit/view.hpp over the widgets of a host.
//
// A role is joined to a node by inheriting from both: `QtView` answers what every view understands,
// `QtControl` what every control does, and a kind adds only what is its own.
#pragma once

#include <QAbstractButton>
#include <QLabel>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

#include "toolkit/qt/accessibility.hpp"
#include "toolkit/qt/image_look.hpp"
#include "toolkit/qt/widget_node.hpp"
#include "toolkit/view.hpp"

namespace toolkit::qt {

/// The view of `widget`, new: a button for a `QAbstractButton`; an image view for a label that
/// shows a pixmap or is marked as one; a text field for a label, a line edit, a text edit and a
/// plain text edit; a plain view for anything else, a combo box too. What it is stays, as long as
/// it has a view.
std::shared_ptr<WidgetNode> makeView(QWidget& widget, const std::shared_ptr<Desk>& desk,
                                     Widget keptBy);

/// What all controls have in common, whatever their role.
class ControlNode : public WidgetNode {
 public:
  using WidgetNode::WidgetNode;

  /// Null when there is none or it is gone.
  std::shared_ptr<Responder> target() const { return target_.lock(); }
  /// Empty when there is none.
  const std::string& action() const { return action_; }
  /// The value that it shows or, where it shows none, keeps.
  virtual AttributedString value() const { return value_; }

 protected:
  virtual void setValue(const AttributedString& value) { value_ = value; }
  /// As `Control::sendAction`; nobody performs an empty action.
  bool send(std::string_view action, const std::shared_ptr<Responder>& target);

  std::weak_ptr<Responder> target_;  // its own maker's
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
  void setTag(Tag tag) final { this->writeTag(tag); }
  Rect frame() const final { return this->readFrame(); }
  // The list follows the widgets, which nobody tells of.
  const Subviews& subviews() const final { return const_cast<QtView*>(this)->readSubviews(); }
  void addSubview(const Ref<View>& view) final { this->insert(view); }
  bool needsDisplay() const final { return this->isRedrawPending(); }
  void setHidden(bool hidden) final { this->hide(hidden); }

  void setToolTip(std::string_view text) final {
    if (this->widget_) showToolTip(*this->widget_, text);
  }
  void setWantsLayer(bool wants) final {
    if (this->widget_) setLayered(*this->widget_, wants);
    this->changed();
  }
  void setLayerContents(const Ref<Image>& image) final {
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

  void setEnabled(bool enabled) final { this->enable(enabled); }
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
    this->setValue(text);
    this->changed();
  }

 protected:
  // A target hears of the clicks in place of the host.
  virtual void takeClicks() {}
  // An action without a target is sent beside what the host does.
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
  void hearClicks() override;
  void clicked();

  State heldState_ = State::off;  // of a button that cannot be checked: nothing of it shows
  QMetaObject::Connection clicks_;
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

  std::weak_ptr<Responder> delegate_;  // its own maker's
};

/// Anything else. Whatever takes the user's input can be enabled and disabled.
class QtOtherView final : public QtView<View> {
 public:
  using QtView::QtView;

  void setEnabled(bool enabled) override;
};

/// Shows its image as scripts ask for, with no frame, in the middle, shrunk to fit; there are no
/// other frames, scalings and alignments.
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

}  // namespace toolkit::qt
