// SPDX-License-Identifier: MIT
// Pictures of steps as data: when they are equal, and what can happen next in them.
#include "tools/walkthrough/possible_steps.hpp"

#include <gtest/gtest.h>

#include "tests/tools/play_support.hpp"

namespace qz::tools::play {
namespace {

using Tags = std::vector<toolkit::Tag>;

TEST(PossibleSteps, AUserCanPressShownAndEnabledButtonsThatTheirTagFinds) {
  StepPicture picture = windowPicture();
  for (const toolkit::Tag tag : {1, 2, 3, 1}) {
    picture.controls.push_back(controlPicture(drivers::ViewKind::button, tag));
  }
  picture.controls.push_back(controlPicture(drivers::ViewKind::textField, 5));
  picture.controls[1].view.hidden = true;
  picture.controls[2].view.enabled = false;
  picture.controls[3].shadowed = true;
  EXPECT_EQ(pressableTags(picture), Tags{1});

  picture.controls[1].view.hidden = false;
  picture.controls[2].view.enabled = true;
  EXPECT_EQ(pressableTags(picture), (Tags{1, 2, 3}));
  picture.window->visible = false;
  EXPECT_EQ(pressableTags(picture), Tags{});
  picture.window.reset();
  EXPECT_EQ(pressableTags(picture), Tags{});
}

TEST(PossibleSteps, AListUnderAPressableButtonOrAPendingTimerContinues) {
  StepPicture picture = windowPicture();
  EXPECT_FALSE(canContinue(picture));
  picture.controls.push_back(controlPicture(drivers::ViewKind::button, 1));
  EXPECT_FALSE(canContinue(picture));
  picture.controls[0].hasList = true;
  EXPECT_TRUE(canContinue(picture));
  picture.controls[0].view.hidden = true;
  EXPECT_FALSE(canContinue(picture));
  picture.timers.push_back({newIdentity(), "2", 1.5});
  EXPECT_TRUE(canContinue(picture));
  picture.ended = true;
  EXPECT_FALSE(canContinue(picture));
}

TEST(PossibleSteps, PicturesAreEqualIfTheyShowTheSame) {
  StepPicture picture = windowPicture();
  picture.controls.push_back(controlPicture(drivers::ViewKind::button, 1, "Next"));
  picture.timers.push_back({newIdentity(), "2", 1.5});
  const StepPicture same = picture;
  EXPECT_EQ(picture, same);
  EXPECT_EQ(hashOf(picture), hashOf(same));

  void (*const changes[])(StepPicture&) = {
      [](StepPicture& changed) { changed.controls[0].view.tag = 2; },
      [](StepPicture& changed) { changed.controls[0].view.hidden = true; },
      [](StepPicture& changed) { changed.controls[0].view.enabled = false; },
      [](StepPicture& changed) { changed.controls[0].view.state = toolkit::State::on; },
      [](StepPicture& changed) { changed.controls[0].view.highlighted = true; },
      [](StepPicture& changed) { changed.controls[0].view.toolTip = "tip"; },
      [](StepPicture& changed) { changed.controls[0].flashing = true; },
      [](StepPicture& changed) {
        changed.controls[0].view.title = toolkit::AttributedString("Go");
      },
      [](StepPicture& changed) { changed.timers[0].timeLeft = 1; },
      [](StepPicture& changed) { changed.timers.clear(); },
      [](StepPicture& changed) { changed.lastList = "1"; },
      [](StepPicture& changed) { changed.flashingAllowed = true; },
      [](StepPicture& changed) { changed.ended = true; },
  };
  for (const auto& change : changes) {
    StepPicture changed = same;
    change(changed);
    EXPECT_NE(changed, same) << &change - changes;
    EXPECT_NE(hashOf(changed), hashOf(same)) << &change - changes;
  }
}

TEST(PossibleSteps, AnotherControlOfTheSameLookIsAnotherPicture) {
  StepPicture picture = windowPicture();
  picture.controls.push_back(controlPicture(drivers::ViewKind::button, 1));
  StepPicture other = picture;
  other.controls[0].identity = newIdentity();
  EXPECT_NE(picture, other);
}

}  // namespace
}  // namespace qz::tools::play
