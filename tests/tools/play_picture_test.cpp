// SPDX-License-Identifier: MIT
// Pictures of a walk-through as text.
#include <gtest/gtest.h>

#include "play_support.hpp"
#include "tools/play/picture_render.hpp"

namespace qz::tools::play {
namespace {

using drivers::ViewKind;
using toolkit::AttributedString;
using toolkit::TextAttributes;

std::string render(const StepPicture& picture, const Style& style = {}) {
  return renderPicture(picture, diffPictures(picture, picture), style);
}

TextAttributes styled() {
  TextAttributes attributes;
  attributes.font = toolkit::Font{"Helvetica", 18, true, false, false};
  attributes.foregroundColor = toolkit::Color{0, 229.0 / 255, 1};
  attributes.paragraphStyle = {{toolkit::TextAlignment::center, 0, 0}};
  return attributes;
}

/// Returns a picture in which every property of a control occurs.
StepPicture everything() {
  StepPicture picture = windowPicture();
  picture.window->layerImage = "paper";
  auto next = controlPicture(drivers::ViewKind::button, 1, "Next");
  next.flashing = true;
  next.view.highlighted = true;
  next.view.background = toolkit::colors::red;
  auto choice = controlPicture(drivers::ViewKind::mixed, 20, "Encrypt");
  choice.view.state = toolkit::State::mixed;
  choice.view.enabled = false;
  choice.view.toolTip = "Choose a password";
  auto heading = controlPicture(drivers::ViewKind::textField, -3);
  heading.view.text = AttributedString("Your first backup", styled());
  auto text = controlPicture(drivers::ViewKind::textField, 4);
  TextAttributes link;
  link.link = "https://example.com/";
  link.underline = true;
  text.view.text = AttributedString("In two minutes all your files will be safe. See ");
  text.view.text.append("how it works", link);
  auto image = controlPicture(drivers::ViewKind::imageView, 4);
  image.view.image = "disk";
  image.shadowed = true;
  auto box = controlPicture(drivers::ViewKind::box, 6);
  box.view.hidden = true;
  picture.controls = {next, choice, heading, text, image, box};
  picture.lastList = "2";
  picture.flashingAllowed = true;
  picture.timers = {{newIdentity(), "5", 2.5}, {newIdentity(), "7", 1e18}};
  return picture;
}

TEST(PlayPicture, ShowsEverythingInColumns) {
  EXPECT_EQ(render(everything()), playData("everything.txt"));
}

TEST(PlayPicture, KeepsWithinANarrowTerminal) {
  EXPECT_EQ(render(everything(), {.color = false, .width = 72}), playData("narrow.txt"));
}

TEST(PlayPicture, SetsApartInColourWhatMatters) {
  StepPicture before = everything();
  StepPicture now = before;
  now.controls[0].view.title = AttributedString("Finish");
  EXPECT_EQ(renderPicture(now, diffPictures(before, now), {.color = true, .width = 100}),
            playData("color.txt"));
}

TEST(PlayPicture, MarksWhatChanged) {
  StepPicture before = everything();
  StepPicture now = before;
  now.controls[0].view.title = AttributedString("Finish");
  now.controls[0].flashing = false;
  now.controls[1].view.tag = 21;
  now.controls[3].view.text =
      AttributedString("Leave the disk plugged in until the last file is copied, please.");
  now.controls.erase(now.controls.begin() + 5);
  now.controls.push_back(controlPicture(drivers::ViewKind::popUpButton, 9, "Daily"));
  now.timers.erase(now.timers.begin());
  now.window->background = toolkit::colors::black;
  now.lastList = "5";
  EXPECT_EQ(renderPicture(now, diffPictures(before, now), {}), playData("changes.txt"));
}

TEST(PlayPicture, SaysWhatThereIsNot) {
  EXPECT_EQ(render(StepPicture{}),
            "  No walk-through window.\n\n  No list was started.\n  Nothing changed.\n");
}

TEST(PlayPicture, SaysThatItEnded) {
  StepPicture picture = windowPicture();
  picture.window->visible = false;
  picture.window->closes = 1;
  picture.lastList = "9";
  picture.ended = true;
  EXPECT_EQ(render(picture),
            "  Window “Backup”: 480 × 320, closed, background white\n\n"
            "  List 9 was started last; the walk-through has ended.\n  Nothing changed.\n");
}

TEST(PlayPicture, HeadingsFillTheLine) {
  EXPECT_EQ(renderHeading(2, "press 3 (Next)", {.color = false, .width = 30}),
            "── 2. press 3 (Next) ─────────\n");
  EXPECT_EQ(renderHeading(12, "start", {.color = false, .width = 5}), "── 12. start ──\n");
}

}  // namespace
}  // namespace qz::tools::play
