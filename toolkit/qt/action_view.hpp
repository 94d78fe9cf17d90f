// SPDX-License-Identifier: MIT
// An action that is only in menus, as a button of an adopted window.
#pragma once

#include <QAction>
#include <QPointer>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

#include "qz/toolkit/view.hpp"
#include "toolkit/qt/action_stand_in.hpp"
#include "toolkit/qt/adopted_form.hpp"
#include "toolkit/qt/desk.hpp"
#include "toolkit/qt/view_change.hpp"

namespace qz::toolkit::qt {

/// An action has no frame, no colours and no styled title, and nobody sees it flash. May outlive
/// the action; then every question returns zero and every change does nothing.
class QtAction final : public Button, public std::enable_shared_from_this<QtAction> {
 public:
  QtAction(QAction& action, std::shared_ptr<Desk> desk);
  ~QtAction() override;

  /// Returns the action's view; null if `view` is that of a widget.
  static std::shared_ptr<QtAction> of(const Ref<View>& view);
  /// Returns the action; null if it is gone.
  QAction* action() const { return action_; }
  bool isHidden() const { return action_ && !action_->isVisible(); }
  bool isEnabled() const { return action_ && action_->isEnabled(); }
  /// Returns the widget that opens the menus with the action, such as a menu bar; null if there is
  /// none.
  QWidget* place() const;
  /// Makes the view a control of an adopted window, as `WidgetNode::joinForm` does.
  void joinForm(const std::shared_ptr<AdoptedForm>& form, Tag tag);

  std::string className() const override;
  Tag tag() const override;
  void setTag(Tag tag) override;
  Rect frame() const override { return {}; }
  const Subviews& subviews() const override;
  void addSubview(const Ref<View>& view) override;
  bool needsDisplay() const override { return false; }
  void setHidden(bool hidden) override;
  void setToolTip(std::string_view text) override;
  void setWantsLayer(bool) override {}
  void setLayerContents(const Ref<Image>&) override {}

  void setEnabled(bool enabled) override;
  void setTarget(const std::shared_ptr<Responder>& target) override;
  void setAction(std::string_view action) override;
  bool sendAction(std::string_view action, const std::shared_ptr<Responder>& target) override;
  std::string stringValue() const override { return value_; }
  void setStringValue(std::string_view text) override { value_ = text; }
  void setAttributedStringValue(const AttributedString& text) override { value_ = text.string(); }

  void setTitle(std::string_view title) override;
  std::optional<AttributedString> attributedTitle() const override;
  void setAttributedTitle(const AttributedString& title) override { setTitle(title.string()); }
  State state() const override;
  void setState(State state) override;
  bool isHighlighted() const override { return isHighlighted_; }
  void highlight(bool highlighted) override { isHighlighted_ = highlighted; }
  void setBackgroundColor(const Color&) override {}
  void setBezelStyle(BezelStyle) override {}

 private:
  ViewChange change();
  void hearTriggers();
  void pressed(bool on);
  void send();

  const QPointer<QAction> action_;
  const QAction* const key_;  // in the desk's table
  const std::shared_ptr<Desk> desk_;
  const bool hadTag_;                // before this view was made
  Tag givenTag_ = 0;                 // that of an action without the property
  std::weak_ptr<AdoptedForm> form_;  // owned by its AdoptedWindow
  std::weak_ptr<Responder> target_;  // owned by the code that made it
  std::string message_;              // that it sends
  std::string value_;
  State heldState_ = State::off;  // of an action that is not checkable
  bool isHighlighted_ = false;
  QMetaObject::Connection triggers_;
  std::unique_ptr<ActionStandIn> standIn_;
};

}  // namespace qz::toolkit::qt
