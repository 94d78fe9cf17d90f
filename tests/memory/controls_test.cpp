// SPDX-License-Identifier: MIT
// Controls: what they show, and how a click changes them.

#include <vector>

#include "tests/memory/support.hpp"
#include "toolkit/memory/views.hpp"

namespace qz::toolkit::memory::test {
namespace {

using ControlsTest = MemoryTest;

TEST_F(ControlsTest, NewControlsHaveTheToolkitsDefaults) {
  const Ref<View> controls[] = {application.makeButton({1, 2, 3, 4}),
                                application.makeImageView({1, 2, 3, 4}),
                                application.makeTextField({1, 2, 3, 4})};
  const drivers::ViewKind kinds[] = {drivers::ViewKind::button, drivers::ViewKind::imageView,
                                     drivers::ViewKind::textField};
  for (std::size_t i = 0; i < 3; ++i) {
    const drivers::ViewPicture picture = driver.look(controls[i]);
    EXPECT_EQ(picture.kind, kinds[i]);
    EXPECT_EQ(picture.className, driver.className(kinds[i]));
    EXPECT_EQ(picture.tag, 0);
    EXPECT_EQ(picture.frame, (Rect{1, 2, 3, 4}));
    EXPECT_TRUE(picture.enabled);
    EXPECT_FALSE(picture.hidden || picture.highlighted);
    EXPECT_EQ(picture.state, State::off);
    EXPECT_EQ(picture.text, AttributedString());
    EXPECT_EQ(picture.toolTip, "");
    EXPECT_EQ(picture.image, std::nullopt);
    EXPECT_EQ(picture.target, nullptr);
    EXPECT_EQ(picture.action, std::nullopt);
    EXPECT_EQ(picture.background, std::nullopt);
  }
  EXPECT_EQ(driver.look(controls[0]).title, AttributedString("Button"));
}

TEST_F(ControlsTest, ATitleIsPlainOrAttributed) {
  TextAttributes red;
  red.foregroundColor = colors::red;
  const Ref<Button> button = asButton(make(drivers::ViewKind::button));
  button->setTitle("Next");
  EXPECT_EQ(button->attributedTitle(), AttributedString("Next"));
  button->setAttributedTitle(AttributedString("Stop", red));
  EXPECT_EQ(button->attributedTitle(), AttributedString("Stop", red));
  button->setTitle("Stop");
  EXPECT_EQ(button->attributedTitle(), AttributedString("Stop"));
  button->setStringValue("value");
  EXPECT_EQ(button->attributedTitle(), AttributedString("Stop"));
}

TEST_F(ControlsTest, AStringValueReadsBackAsSet) {
  TextAttributes underlined;
  underlined.underline = true;
  for (const drivers::ViewKind kind :
       {drivers::ViewKind::button, drivers::ViewKind::textField, drivers::ViewKind::imageView}) {
    const Ref<View> control = make(kind);
    EXPECT_EQ(control->stringValue(), "");
    control->setAttributedStringValue(AttributedString("styled", underlined));
    EXPECT_EQ(control->stringValue(), "styled");
    EXPECT_EQ(driver.look(control).text, AttributedString("styled", underlined));
    control->setStringValue("pl\xC3\xA4in");
    EXPECT_EQ(control->stringValue(), "pl\xC3\xA4in");
    EXPECT_EQ(driver.look(control).text, AttributedString("pl\xC3\xA4in"));
  }
}

TEST_F(ControlsTest, ATextFieldsTitleIsItsText) {
  const Ref<TextField> field = asTextField(make(drivers::ViewKind::textField));
  field->setTitle("Hello");
  EXPECT_EQ(field->stringValue(), "Hello");
}

TEST_F(ControlsTest, StylesAreKept) {
  const auto button = std::make_shared<MemoryButton>(ButtonBehavior::push, Rect{}, nullptr);
  EXPECT_EQ(button->bezelStyle(), BezelStyle::rounded);
  button->setBezelStyle(BezelStyle::texturedSquare);
  EXPECT_EQ(button->bezelStyle(), BezelStyle::texturedSquare);
  button->setBackgroundColor(colors::red);
  EXPECT_EQ(button->backgroundColor(), colors::red);

  const auto imageView = std::make_shared<MemoryImageView>(Rect{}, nullptr);
  imageView->setImageFrameStyle(ImageFrameStyle{3});
  imageView->setImageScaling(ImageScaling{2});
  imageView->setImageAlignment(ImageAlignment{1});
  EXPECT_EQ(imageView->imageFrameStyle(), ImageFrameStyle{3});
  EXPECT_EQ(imageView->imageScaling(), ImageScaling{2});
  EXPECT_EQ(imageView->imageAlignment(), ImageAlignment{1});
}

TEST_F(ControlsTest, ATextFieldDoesNotKeepItsDelegate) {
  const auto field = std::make_shared<MemoryTextField>(Rect{}, nullptr);
  auto delegate = std::make_shared<Recorder>();
  field->setDelegate(delegate);
  EXPECT_EQ(field->delegate(), delegate);
  delegate = nullptr;
  EXPECT_EQ(field->delegate(), nullptr);
}

TEST_F(ControlsTest, OnlyAThreeStateButtonCanBeMixed) {
  const struct {
    drivers::ViewKind kind;
    State mixed;
  } cases[] = {{drivers::ViewKind::button, State::on},
               {drivers::ViewKind::toggle, State::on},
               {drivers::ViewKind::popUpButton, State::on},
               {drivers::ViewKind::mixed, State::mixed}};
  for (const auto& c : cases) {
    const Ref<Button> button = asButton(make(c.kind));
    button->setState(State::mixed);
    EXPECT_EQ(button->state(), c.mixed);
    button->setState(State::off);
    EXPECT_EQ(button->state(), State::off);
  }
}

TEST_F(ControlsTest, AClickChangesTheStateBeforeTheActionIsSent) {
  const struct {
    drivers::ViewKind kind;
    std::vector<State> states;  // after each click
  } cases[] = {
      {drivers::ViewKind::button, {State::off, State::off}},
      {drivers::ViewKind::popUpButton, {State::off, State::off}},
      {drivers::ViewKind::toggle, {State::on, State::off, State::on}},
      {drivers::ViewKind::mixed, {State::mixed, State::on, State::off, State::mixed}},
  };
  for (const auto& c : cases) {
    const auto target = std::make_shared<Recorder>();
    std::vector<State> seen;
    target->perform = [&](const Ref<View>& sender) { seen.push_back(sender->state()); };
    const Ref<Button> button = makeButton(target, c.kind);
    for (std::size_t i = 0; i < c.states.size(); ++i) driver.click(button);
    EXPECT_EQ(seen, c.states);
  }
}

TEST_F(ControlsTest, APushButtonKeepsTheStateThatItWasGiven) {
  const Ref<Button> button = makeButton(nullptr);
  button->setState(State::on);
  driver.click(button);
  EXPECT_EQ(button->state(), State::on);
}

TEST_F(ControlsTest, AClickEndsThePressedInLook) {
  const Ref<Button> button = makeButton(nullptr);
  button->highlight(true);
  EXPECT_TRUE(button->isHighlighted());
  button->setEnabled(false);
  driver.click(button);
  EXPECT_TRUE(driver.look(button).highlighted);
  button->setEnabled(true);
  driver.click(button);
  EXPECT_FALSE(driver.look(button).highlighted);
}

TEST_F(ControlsTest, AClickThatDoesNotArriveDoesNothing) {
  const auto target = std::make_shared<Recorder>();
  const Ref<View> box = make(drivers::ViewKind::box, 9);
  const Ref<Button> button = makeButton(target, drivers::ViewKind::toggle);
  box->addSubview(button);
  struct Obstacle {
    const char* what;
    std::function<void(bool)> put;
  };
  const Obstacle obstacles[] = {
      {"disabled", [&](bool there) { button->setEnabled(!there); }},
      {"hidden", [&](bool there) { button->setHidden(there); }},
      {"in a hidden box", [&](bool there) { box->setHidden(there); }},
      {"hidden content", [&](bool there) { window->contentView()->setHidden(there); }},
      {"no window",
       [&](bool there) {
         there ? driver.removeFromSuperview(box) : window->contentView()->addSubview(box);
       }},
      {"window off the screen",
       [&](bool there) { there ? window->orderOut() : window->makeKeyAndOrderFront(); }},
  };
  State state = State::off;
  for (const Obstacle& obstacle : obstacles) {
    target->senders.clear();
    obstacle.put(true);
    driver.click(button);
    EXPECT_TRUE(target->senders.empty()) << obstacle.what;
    EXPECT_EQ(button->state(), state) << obstacle.what;
    obstacle.put(false);
    driver.click(button);
    EXPECT_EQ(target->senders.size(), 1U) << "no longer " << obstacle.what;
    state = button->state();
  }
}

TEST_F(ControlsTest, OnlyButtonsTakeClicks) {
  const auto target = std::make_shared<Recorder>();
  for (const drivers::ViewKind kind :
       {drivers::ViewKind::textField, drivers::ViewKind::imageView, drivers::ViewKind::box}) {
    const Ref<View> view = make(kind);
    if (const auto control = std::dynamic_pointer_cast<Control>(view.pointer())) {
      control->setTarget(target);
      control->setAction("pressed:");
    }
    driver.click(view);
  }
  driver.click(nullptr);
  EXPECT_TRUE(target->asked.empty());
}

}  // namespace
}  // namespace qz::toolkit::memory::test
