// SPDX-License-Identifier: MIT
// Fake windows and views for tests, which record the calls they receive and can misbehave.
#pragma once

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "qz/toolkit/view.hpp"
#include "qz/toolkit/window.hpp"

namespace qz::fakes {

/// Supports the operations that every view has, and records the calls that change how the view is
/// drawn or ask about it.
template <class Role>
class FakeRole : public Role {
 public:
  explicit FakeRole(toolkit::Tag tag = 0) : tag_(tag) {}

  std::string className() const override { return "Fake"; }
  toolkit::Tag tag() const override { return tag_; }
  void setTag(toolkit::Tag tag) override { tag_ = tag; }
  toolkit::Rect frame() const override { return {}; }
  const toolkit::Subviews& subviews() const override { return views; }
  void addSubview(const toolkit::Ref<toolkit::View>& view) override { views.push_back(view); }
  void setHidden(bool hidden) override { note(hidden ? "hide" : "show"); }
  void setToolTip(std::string_view text) override {
    note("tooltip");
    toolTip = text;
  }
  bool needsDisplay() const override {
    note("needsDisplay");
    return false;
  }
  void setWantsLayer(bool wants) override { note(wants ? "layer" : "no layer"); }
  void setLayerContents(const toolkit::Ref<toolkit::Image>&) override { note("contents"); }
  void setEnabled(bool enabled) override { note(enabled ? "enable" : "disable"); }

  toolkit::Subviews views;
  std::string toolTip;
  /// The recorded calls, in order.
  mutable std::vector<std::string> calls;
  /// Called with every call before it is recorded.
  std::function<void(const std::string&)> onCall;

 private:
  void note(const std::string& call) const {
    if (onCall) onCall(call);
    calls.push_back(call);
  }

  toolkit::Tag tag_;
};

/// A view that reports a kind of control, whose operations do nothing.
class FakeView : public FakeRole<toolkit::View> {
 public:
  enum class Kind { plain, button, textField, imageView };

  explicit FakeView(toolkit::Tag tag = 0, Kind kind = Kind::plain) : FakeRole(tag), kind_(kind) {}

  toolkit::Button* asButton() override { return as<toolkit::Button>(Kind::button); }
  toolkit::TextField* asTextField() override { return as<toolkit::TextField>(Kind::textField); }
  toolkit::ImageView* asImageView() override { return as<toolkit::ImageView>(Kind::imageView); }

 private:
  template <class T>
  T* as(Kind kind) const {
    return kind_ == kind ? &T::nothing() : nullptr;
  }

  Kind kind_;
};

class FakeWindow final : public toolkit::Window {
 public:
  explicit FakeWindow(toolkit::Ref<toolkit::View> content) : content_(std::move(content)) {}

  toolkit::Ref<toolkit::View> contentView() const override { return content_; }
  std::shared_ptr<toolkit::Responder> delegate() const override { return delegate_.lock(); }
  void setDelegate(const std::shared_ptr<toolkit::Responder>& delegate) override {
    delegate_ = delegate;
  }
  void setBackgroundColor(const toolkit::Color&) override {}
  void makeKeyAndOrderFront() override {}
  void orderOut() override {}
  void close() override {
    ++closes;
    if (onClose) onClose();
  }

  int closes = 0;
  std::function<void()> onClose;

 private:
  toolkit::Ref<toolkit::View> content_;
  std::weak_ptr<toolkit::Responder> delegate_;
};

/// Returns a window whose content view contains only `view`.
inline std::shared_ptr<FakeWindow> windowWith(const std::shared_ptr<toolkit::View>& view) {
  const auto content = std::make_shared<FakeRole<toolkit::View>>();
  content->views.emplace_back(view);
  return std::make_shared<FakeWindow>(content);
}

}  // namespace qz::fakes
