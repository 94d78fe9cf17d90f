// SPDX-License-Identifier: MIT
// The objects behind absent references. Each accepts every message, does nothing and answers zero,
// NO, empty or absent.
//
// Invariant: none of them has state, so that all absent references of a type can share one object.

#include "qz/toolkit/image.hpp"
#include "qz/toolkit/run_loop.hpp"
#include "qz/toolkit/view.hpp"
#include "qz/toolkit/window.hpp"

namespace qz::toolkit {

namespace {

// Returns the one T that represents nothing. Never destroyed: objects that are destroyed at program
// exit may still send messages to absent references.
template <class T>
T& theOnly() {
  static T* const object = new T;
  return *object;
}

// The messages that every view understands, and those that only some kinds do. An absent view
// raises for none of them.
template <class Role>
class NothingView : public Role {
 public:
  std::string className() const override { return {}; }
  Button* asButton() override { return nullptr; }
  TextField* asTextField() override { return nullptr; }
  ImageView* asImageView() override { return nullptr; }

  Tag tag() const override { return 0; }
  void setTag(Tag) override {}
  Rect frame() const override { return {}; }
  const Subviews& subviews() const override { return theOnly<Subviews>(); }
  void addSubview(const Ref<View>&) override {}
  void setHidden(bool) override {}
  void setToolTip(std::string_view) override {}
  bool needsDisplay() const override { return false; }
  void setWantsLayer(bool) override {}
  void setLayerContents(const Ref<Image>&) override {}

  void setEnabled(bool) override {}
  void setAction(std::string_view) override {}
  std::string stringValue() const override { return {}; }
  void setStringValue(std::string_view) override {}
  void setAttributedStringValue(const AttributedString&) override {}
  void highlight(bool) override {}
  std::optional<AttributedString> attributedTitle() const override { return std::nullopt; }
  void setAttributedTitle(const AttributedString&) override {}
  State state() const override { return State::off; }
};

template <class Role>
class NothingControl : public NothingView<Role> {
 public:
  void setTarget(const std::shared_ptr<Responder>&) override {}
  bool sendAction(std::string_view, const std::shared_ptr<Responder>&) override { return false; }
};

class NothingButton final : public NothingControl<Button> {
 public:
  void setTitle(std::string_view) override {}
  void setState(State) override {}
  bool isHighlighted() const override { return false; }
  void setBackgroundColor(const Color&) override {}
  void setBezelStyle(BezelStyle) override {}
};

class NothingTextField final : public NothingControl<TextField> {
 public:
  void setTitle(std::string_view) override {}
  void setDelegate(const std::shared_ptr<Responder>&) override {}
};

class NothingImageView final : public NothingControl<ImageView> {
 public:
  void setImage(const Ref<Image>&) override {}
  void setImageFrameStyle(ImageFrameStyle) override {}
  void setImageScaling(ImageScaling) override {}
  void setImageAlignment(ImageAlignment) override {}
};

class NothingWindow final : public Window {
 public:
  Ref<View> contentView() const override { return {}; }
  std::shared_ptr<Responder> delegate() const override { return nullptr; }
  void setDelegate(const std::shared_ptr<Responder>&) override {}
  void setBackgroundColor(const Color&) override {}
  void makeKeyAndOrderFront() override {}
  void orderOut() override {}
  void close() override {}
};

class NothingTimer final : public Timer {
 public:
  bool isValid() const override { return false; }
  void invalidate() override {}
  double interval() const override { return 0; }
  double timeLeft() const override { return 0; }
};

class NothingImage final : public Image {
 public:
  std::string name() const override { return {}; }
};

}  // namespace

View& View::nothing() { return theOnly<NothingView<View>>(); }
Button& Button::nothing() { return theOnly<NothingButton>(); }
TextField& TextField::nothing() { return theOnly<NothingTextField>(); }
ImageView& ImageView::nothing() { return theOnly<NothingImageView>(); }
Window& Window::nothing() { return theOnly<NothingWindow>(); }
Timer& Timer::nothing() { return theOnly<NothingTimer>(); }
Image& Image::nothing() { return theOnly<NothingImage>(); }

}  // namespace qz::toolkit
