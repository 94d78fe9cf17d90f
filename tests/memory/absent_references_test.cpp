// SPDX-License-Identifier: MIT
// Absent references: every message does nothing and answers zero, NO, empty or absent.

#include <gtest/gtest.h>

#include "qz/toolkit/image.hpp"
#include "qz/toolkit/run_loop.hpp"
#include "qz/toolkit/view.hpp"
#include "qz/toolkit/window.hpp"

namespace qz::toolkit {
namespace {

// An absent view of any kind answers the same before and after every message.
template <class Kind>
class AbsentView : public testing::Test {};
using Kinds = testing::Types<View, Button, TextField, ImageView>;
TYPED_TEST_SUITE(AbsentView, Kinds);

template <class Kind>
void expectNothing(const Ref<Kind>& view) {
  EXPECT_EQ(view->className(), "");
  EXPECT_EQ(view->tag(), 0);
  EXPECT_EQ(view->frame(), Rect{});
  EXPECT_TRUE(view->subviews().empty());
  EXPECT_FALSE(view->needsDisplay());
  EXPECT_EQ(view->stringValue(), "");
  EXPECT_FALSE(view->attributedTitle().has_value());
  EXPECT_EQ(view->state(), State::off);
  EXPECT_EQ(view->asButton(), nullptr);
  EXPECT_EQ(view->asTextField(), nullptr);
  EXPECT_EQ(view->asImageView(), nullptr);
  EXPECT_EQ(view->asGradient(), nullptr);
  EXPECT_FALSE(view->tryToPerform("pressed:", nullptr));
}

TYPED_TEST(AbsentView, DoesNothing) {
  const Ref<TypeParam> absent;
  expectNothing(absent);
  absent->setTag(7);
  absent->addSubview(nullptr);
  absent->setHidden(true);
  absent->setToolTip("tip");
  absent->setWantsLayer(true);
  absent->setLayerContents(nullptr);
  absent->setEnabled(false);
  absent->setAction("pressed:");
  absent->setStringValue("text");
  absent->setAttributedStringValue(AttributedString("text"));
  absent->highlight(true);
  absent->setAttributedTitle(AttributedString("title"));
  expectNothing(absent);
}

TEST(AbsentControl, SendsNoAction) {
  const Ref<Button> button;
  const Ref<TextField> field;
  const Ref<ImageView> imageView;
  button->setTarget(nullptr);
  field->setTarget(nullptr);
  imageView->setTarget(nullptr);
  EXPECT_FALSE(button->sendAction("pressed:", nullptr));
  EXPECT_FALSE(field->sendAction("pressed:", nullptr));
  EXPECT_FALSE(imageView->sendAction("pressed:", nullptr));
}

TEST(AbsentControl, KeepsNothingOfItsKind) {
  const Ref<Button> button;
  button->setTitle("title");
  button->setState(State::on);
  button->highlight(true);
  button->setBackgroundColor(colors::red);
  button->setBezelStyle(BezelStyle::texturedSquare);
  EXPECT_FALSE(button->isHighlighted());
  expectNothing(button);

  const Ref<TextField> field;
  field->setTitle("title");
  field->setDelegate(nullptr);
  expectNothing(field);

  const Ref<ImageView> imageView;
  imageView->setImage(nullptr);
  imageView->setImageFrameStyle(ImageFrameStyle::none);
  imageView->setImageScaling(ImageScaling::proportionallyDown);
  imageView->setImageAlignment(ImageAlignment::center);
  expectNothing(imageView);
}

TEST(AbsentWindow, DoesNothing) {
  const Ref<Window> window;
  window->setDelegate(nullptr);
  window->setBackgroundColor(colors::red);
  window->makeKeyAndOrderFront();
  window->orderOut();
  window->close();
  EXPECT_FALSE(window->contentView());
  EXPECT_EQ(window->delegate(), nullptr);
  EXPECT_TRUE(window->contentView()->subviews().empty());
}

TEST(AbsentTimer, IsInvalid) {
  const Ref<Timer> timer;
  timer->invalidate();
  EXPECT_FALSE(timer->isValid());
  EXPECT_EQ(timer->interval(), 0);
  EXPECT_EQ(timer->timeLeft(), 0);
}

TEST(AbsentImage, HasNoName) { EXPECT_EQ(Ref<Image>()->name(), ""); }

TEST(AbsentReference, IsOfNoKind) {
  EXPECT_FALSE(asButton(nullptr));
  EXPECT_FALSE(asTextField(nullptr));
  EXPECT_FALSE(asImageView(nullptr));
}

}  // namespace
}  // namespace qz::toolkit
