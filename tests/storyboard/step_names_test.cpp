// SPDX-License-Identifier: MIT
// Steps are named by what they are and by what is different in them.
#include "tools/storyboard/step_names.hpp"

#include <gtest/gtest.h>

#include <set>
#include <string>
#include <vector>

namespace qz::tools::storyboard {
namespace {

using drivers::ViewKind;
using walkthrough::ControlPicture;
using walkthrough::StepPicture;

ControlPicture controlOf(ViewKind kind, const std::string& name) {
  ControlPicture control;
  control.name = name;
  control.view.kind = kind;
  return control;
}

/// A window with a text field “Body” and a check box “Expert”.
StepPicture window() {
  StepPicture picture;
  picture.controls = {controlOf(ViewKind::textField, "Body"),
                      controlOf(ViewKind::toggle, "Expert")};
  return picture;
}

/// Returns the names of steps of one group, of which only the pictures are different.
std::vector<StepName> namesOf(const std::vector<StepPicture>& pictures, const std::string& group,
                              bool hasNames = true) {
  BoardStep step;
  step.group = group;
  return stepNames(std::vector<BoardStep>(pictures.size(), step), pictures, hasNames);
}

/// Returns what is added to the name of a step whose window is different from that of the first.
StepName addedFor(const StepPicture& other) {
  const StepName name = namesOf({window(), other}, "Hello").back();
  return {name.id.substr(5), name.title.substr(5)};
}

TEST(StepNames, SayWhatIsDifferent) {
  StepPicture other = window();
  other.controls[0].view.text = toolkit::AttributedString("One line\nand another");
  EXPECT_EQ(addedFor(other).title, ": “One line”");
  EXPECT_EQ(addedFor(other).id, "-one-line");
  other = window();
  other.controls[1].view.hidden = true;
  EXPECT_EQ(addedFor(other).title, ": without expert");
  other = window();
  other.controls[1].view.enabled = false;
  EXPECT_EQ(addedFor(other).title, ": expert disabled");
  other = window();
  other.controls[1].view.state = toolkit::State::on;
  EXPECT_EQ(addedFor(other).title, ": expert on");
}

TEST(StepNames, SayWhatIsThereOrCanBePressedAgain) {
  StepPicture first = window();
  first.controls[0].view.hidden = true;
  first.controls[1].view.enabled = false;
  StepPicture shown = first;
  shown.controls[0].view.hidden = false;
  StepPicture enabled = first;
  enabled.controls[1].view.enabled = true;
  StepPicture other = first;
  other.controls[0].view.text = toolkit::AttributedString("Nobody reads what is hidden");
  const auto names = namesOf({first, shown, enabled, other}, "Hello");
  EXPECT_EQ(names[1].title, "Hello: with body");
  EXPECT_EQ(names[2].title, "Hello: expert enabled");
  EXPECT_EQ(names[3].title, "Hello");
}

TEST(StepNames, AreDifferentWhereNoWordIs) {
  StepPicture other = window();
  other.controls[1].view.tag = 7;
  StepPicture waiting = window();
  waiting.timers.push_back({.identity = {}, .key = "9", .timeLeft = 5});
  StepPicture tipped = window();
  tipped.controls[0].view.toolTip = "More";
  const std::vector<StepPicture> pictures = {window(), other, waiting, tipped, tipped, tipped};
  const auto names = namesOf(pictures, "12", false);
  EXPECT_EQ(names[0].id, "list-12");
  std::set<std::string> ids;
  for (const StepName& name : names) {
    EXPECT_EQ(name.title, "List 12");
    EXPECT_TRUE(ids.insert(name.id).second) << name.id;
  }
  EXPECT_EQ(names[4].id, names[3].id + "-2") << "nobody can tell them apart";
  EXPECT_EQ(names[5].id, names[3].id + "-3");
  EXPECT_EQ(namesOf({window(), waiting}, "12", false)[1].id, names[2].id)
      << "it does not depend on the other steps";
}

TEST(StepNames, AreMadeOfAnyScript) {
  const auto hello = namesOf({window()}, "Привет").front();
  const auto bye = namesOf({window()}, "Пока").front();
  EXPECT_EQ(hello.title, "Привет");
  EXPECT_EQ(hello.id.size(), 8U);
  EXPECT_EQ(hello.id.find_first_not_of("0123456789abcdef"), std::string::npos) << hello.id;
  EXPECT_NE(hello.id, bye.id);
}

}  // namespace
}  // namespace qz::tools::storyboard
