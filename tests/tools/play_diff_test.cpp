// SPDX-License-Identifier: MIT
// The changes from one picture to the next.
#include <gtest/gtest.h>

#include <functional>

#include "play_support.hpp"
#include "tools/play/picture_diff.hpp"

namespace qz::tools::play {

// For the messages of failed tests.
void PrintTo(const Change& change, std::ostream* out) {
  *out << change.what << ": " << change.before << " -> " << change.now;
}

namespace {

using drivers::ViewKind;
using toolkit::AttributedString;
using toolkit::TextAttributes;
using Changes = std::vector<Change>;

TextAttributes bold() {
  TextAttributes attributes;
  attributes.font = toolkit::Font{"Times", 12, true, false, false};
  return attributes;
}

TextAttributes indented(double firstLine) {
  TextAttributes attributes;
  attributes.paragraphStyle = {{toolkit::TextAlignment::natural, firstLine, 0}};
  return attributes;
}

/// Returns a text of two runs, the second bold.
AttributedString halfBold(const std::string& first, const std::string& second) {
  AttributedString text(first);
  text.append(second, bold());
  return text;
}

StepPicture oneControl(drivers::ViewKind kind) {
  StepPicture picture = windowPicture();
  picture.controls = {controlPicture(kind, 7)};
  return picture;
}

TEST(PlayDiff, NamesEveryChangeOfAControl) {
  const struct {
    std::function<void(ControlPicture&)> change;
    Change expected;
  } cases[] = {
      {[](auto& c) { c.view.tag = 40; }, {"tag", "7", "40"}},
      {[](auto& c) {
         c.view.frame = {1, 2, 3, 4.5};
       },
       {"frame", "0 × 0 at 0, 0", "3 × 4.5 at 1, 2"}},
      {[](auto& c) { c.view.title = AttributedString("Next"); }, {"title", "“”", "“Next”"}},
      {[](auto& c) { c.view.text = AttributedString("a\nb"); }, {"text", "“”", "“a\\nb”"}},
      {[](auto& c) { c.view.image = "disk"; }, {"image", "none", "“disk”"}},
      {[](auto& c) { c.view.hidden = true; }, {"hidden", "no", "yes"}},
      {[](auto& c) { c.view.enabled = false; }, {"enabled", "yes", "no"}},
      {[](auto& c) { c.view.state = toolkit::State::mixed; }, {"state", "off", "mixed"}},
      {[](auto& c) { c.flashing = true; }, {"flashing", "no", "yes"}},
      {[](auto& c) { c.view.highlighted = true; }, {"highlighted", "no", "yes"}},
      {[](auto& c) { c.view.background = toolkit::colors::red; }, {"background", "none", "red"}},
      {[](auto& c) { c.view.toolTip = "Help"; }, {"tooltip", "none", "“Help”"}},
  };
  for (const auto& c : cases) {
    const StepPicture before = oneControl(drivers::ViewKind::button);
    StepPicture now = before;
    c.change(now.controls[0]);
    const PictureChanges changes = diffPictures(before, now);
    EXPECT_EQ(changes.controls[0].changes, Changes{c.expected});
    EXPECT_FALSE(changes.none()) << c.expected.what;
  }
}

TEST(PlayDiff, NamesEveryChangeOfTheWindow) {
  const struct {
    std::function<void(drivers::WindowPicture&)> change;
    Change expected;
  } cases[] = {
      {[](auto& w) {
         w.content = {0, 0, 10, 20};
       },
       {"rectangle", "480 × 320 at 200, 200", "10 × 20 at 0, 0"}},
      {[](auto& w) { w.visible = false; }, {"on the screen", "yes", "no"}},
      {[](auto& w) { w.closes = 2; }, {"times closed", "0", "2"}},
      {[](auto& w) {
         w.background = {0, 0, 0, 0.5};
       },
       {"background", "white", "#000000 at 50%"}},
      {[](auto& w) { w.layerImage = "paper"; }, {"background image", "none", "“paper”"}},
  };
  for (const auto& c : cases) {
    const StepPicture before = windowPicture();
    StepPicture now = before;
    c.change(*now.window);
    EXPECT_EQ(diffPictures(before, now).window, Changes{c.expected});
  }
}

/// Returns the changes reported for a text field that shows `now` after `before`.
Changes textChanges(const AttributedString& before, const AttributedString& now) {
  StepPicture first = oneControl(drivers::ViewKind::textField);
  first.controls[0].view.text = before;
  StepPicture second = first;
  second.controls[0].view.text = now;
  return diffPictures(first, second).controls[0].changes;
}

TEST(PlayDiff, TheStyleOfATextThatStaysIsToldPieceByPiece) {
  const struct {
    const char* what;
    AttributedString before;
    AttributedString now;
    Changes expected;
  } cases[] = {
      {"another style",
       AttributedString("Hi"),
       AttributedString("Hi", bold()),
       {{"style", "plain", "Times 12 bold"}}},
      {"styled elsewhere",
       halfBold("ab", "c"),
       halfBold("a", "bc"),
       {{"style", "“ab” plain; “c” Times 12 bold", "“a” plain; “bc” Times 12 bold"}}},
      {"a style that no word is for",
       AttributedString("Hi", indented(1)),
       AttributedString("Hi", indented(2)),
       {{"style", "plain", "other plain"}}},
      {"the same", halfBold("ab", "c"), halfBold("ab", "c"), {}},
  };
  for (const auto& c : cases) EXPECT_EQ(textChanges(c.before, c.now), c.expected) << c.what;
}

TEST(PlayDiff, TheStyleOfAnotherTextIsToldInShort) {
  AttributedString boldFirst("x", bold());
  boldFirst.append("y", {});
  const struct {
    const char* what;
    AttributedString before;
    AttributedString now;
    Changes expected;
  } cases[] = {
      {"the same styles", halfBold("ab", "c"), halfBold("x", "yz"), {{"text", "“abc”", "“xyz”"}}},
      {"fewer styles",
       halfBold("ab", "c"),
       AttributedString("x"),
       {{"text", "“abc”", "“x”"}, {"style", "2 pieces", "plain"}}},
      {"as many other styles",
       halfBold("ab", "c"),
       boldFirst,
       {{"text", "“abc”", "“xy”"}, {"style", "2 pieces", "other 2 pieces"}}},
      {"none where there was no text",
       AttributedString(),
       AttributedString("x"),
       {{"text", "“”", "“x”"}}},
  };
  for (const auto& c : cases) EXPECT_EQ(textChanges(c.before, c.now), c.expected) << c.what;
}

TEST(PlayDiff, ControlsAreKnownAgainByThemselvesNotByTheirTag) {
  StepPicture before = windowPicture();
  before.controls = {controlPicture(drivers::ViewKind::button, 1, "A"),
                     controlPicture(drivers::ViewKind::button, 2, "B")};
  StepPicture now = before;
  now.controls[0].view.tag = 2;
  now.controls[1] = controlPicture(drivers::ViewKind::button, 2, "B");
  const PictureChanges changes = diffPictures(before, now);
  EXPECT_EQ(changes.controls[0].changes, (Changes{{"tag", "1", "2"}}));
  EXPECT_TRUE(changes.controls[1].isNew);
  ASSERT_EQ(changes.gone.size(), 1U);
  EXPECT_EQ(changes.gone[0].view.title.string(), "B");
}

TEST(PlayDiff, TimersCountWhenArmedAndWhenGone) {
  StepPicture before = windowPicture();
  before.timers = {{newIdentity(), "3", 1}, {newIdentity(), "5", 2}, {newIdentity(), "7", 3}};
  StepPicture now = before;
  now.timers[0].timeLeft = 0.5;                   // only its time passes
  now.timers[1] = {newIdentity(), "5", 2};        // armed again
  now.timers[2] = {newIdentity(), "-1", 1.8e19};  // another timer
  const Changes expected = {{"timer of list -1", "none", "fires practically never"},
                            {"timer of list 5", "fires in 2 s", "armed again, fires in 2 s"},
                            {"timer of list 7", "fires in 3 s", "none"}};
  EXPECT_EQ(diffPictures(before, now).engine, expected);
}

TEST(PlayDiff, NamesWhatTheEngineIsUpTo) {
  const StepPicture before = windowPicture();
  StepPicture now = before;
  now.lastList = "9";
  now.flashingAllowed = true;
  now.ended = true;
  const Changes expected = {{"list started last", "none", "9"},
                            {"flashing allowed", "no", "yes"},
                            {"walk-through ended", "no", "yes"}};
  EXPECT_EQ(diffPictures(before, now).engine, expected);
  EXPECT_TRUE(diffPictures(now, now).none());
}

}  // namespace
}  // namespace qz::tools::play
