// SPDX-License-Identifier: MIT
// Which controls a user can press, and what the walk-through waits for.
#include <gtest/gtest.h>

#include "play_support.hpp"
#include "tools/play/pressing.hpp"

namespace qz::tools::play {
namespace {

using drivers::ViewKind;

StepPicture buttons() {
  StepPicture picture = windowPicture();
  auto next = controlPicture(drivers::ViewKind::button, 1, "Next\nplease");
  next.hasList = true;
  auto hidden = controlPicture(drivers::ViewKind::button, 2, "Back");
  hidden.view.hidden = true;
  hidden.hasList = true;
  auto disabled = controlPicture(drivers::ViewKind::button, 3, "Stop");
  disabled.view.enabled = false;
  disabled.hasList = true;
  auto toggle = controlPicture(drivers::ViewKind::toggle, 4);
  auto text = controlPicture(drivers::ViewKind::textField, 5, "Hello");
  auto front = controlPicture(drivers::ViewKind::button, 5, "In front");
  front.shadowed = true;
  front.hasList = true;
  picture.controls = {next, hidden, disabled, toggle, text, front};
  return picture;
}

TEST(PlayPressing, SaysWhyAControlCannotBePressed) {
  const std::string others = "; press 1 (Next) or 4";
  const struct {
    toolkit::Tag tag;
    std::optional<std::string> reason;
  } cases[] = {
      {1, std::nullopt},
      {2, "control 2 is hidden" + others},
      {3, "control 3 is disabled" + others},
      {4, std::nullopt},
      {5, "control 5 is not a button" + others},
      {6, "no control has the tag 6" + others},
  };
  for (const auto& c : cases) EXPECT_EQ(whyNotPress(buttons(), c.tag), c.reason) << c.tag;
}

TEST(PlayPressing, NothingCanBePressedWithoutAWindow) {
  StepPicture picture = buttons();
  picture.window->visible = false;
  EXPECT_EQ(whyNotPress(picture, 1), "the window is not on the screen");
  picture.window.reset();
  EXPECT_EQ(whyNotPress(picture, 1), "the window is not on the screen");
  picture.ended = true;
  EXPECT_EQ(whyNotPress(picture, 1), "the walk-through has ended");
}

TEST(PlayPressing, SaysWhenThereIsNothingElseToPress) {
  EXPECT_EQ(whyNotPress(windowPicture(), 1), "no control has the tag 1; no button can be pressed");
}

TEST(PlayPressing, NamesAButtonByTagAndTitle) {
  EXPECT_EQ(pressWords(buttons(), 1), "1 (Next)");
  EXPECT_EQ(pressWords(buttons(), 4), "4");
  EXPECT_EQ(pressWords(buttons(), 5), "5");
  EXPECT_EQ(pressWords(buttons(), -6), "-6");
}

TEST(PlayPressing, SaysWhatTheWalkThroughWaitsFor) {
  StepPicture picture = buttons();
  EXPECT_EQ(standing(picture), "The walk-through waits for a press of 1 (Next).");
  EXPECT_EQ(whyNoWayOn(picture), std::nullopt);
  picture.controls[3].hasList = true;
  picture.timers = {{newIdentity(), "8", 2}, {newIdentity(), "9", 1e18}};
  EXPECT_EQ(standing(picture),
            "The walk-through waits for a press of 1 (Next) or 4, list 8 to run in 2 s or list 9 "
            "to run practically never.");
  picture.controls.clear();
  picture.timers.clear();
  EXPECT_EQ(standing(picture),
            "The walk-through is stuck: no timer is pending, and no button that can be "
            "pressed has a list.");
  EXPECT_EQ(whyNoWayOn(picture),
            "no timer is pending, and no button that can be pressed has a list");
  picture.timers = {{newIdentity(), "8", 2}};
  EXPECT_EQ(whyNoWayOn(picture), std::nullopt);
  picture.timers.clear();
  picture.ended = true;
  EXPECT_EQ(whyNoWayOn(picture), std::nullopt);
  EXPECT_EQ(standing(picture), "The walk-through ended.");
}

}  // namespace
}  // namespace qz::tools::play
