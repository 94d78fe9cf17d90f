// SPDX-License-Identifier: MIT
// What users would notice, and how it is said.
#include <gtest/gtest.h>

#include "tests/check/small_scripts.hpp"
#include "tests/diff/diffed_scripts.hpp"

namespace qz::tools::diff {
namespace {

using drivers::ViewKind;
using Kind = Change::Kind;

walkthrough::HostWindow smallWindow() {
  return naive::test::window(
      {{ViewKind::textField, 1}, {ViewKind::button, 2}, {ViewKind::toggle, 3}});
}

constexpr const char* original = R"({
  0 = ((SET_TEXT_FOR_OBJECT_ID, Hello, 1));
  2 = ((SET_TEXT_FOR_OBJECT_ID, Bye, 1), (SET_TAG_FOR_OBJECT_ID, 20, 2), (SET_TIMER_FOR_ID, 5, 7));
  3 = ();
  7 = (TERMINATE_PARSER);
  20 = (TERMINATE_PARSER);
})";

/// Returns the original with one part replaced.
std::string changed(const std::string& part, const std::string& by) {
  std::string script = original;
  return script.replace(script.find(part), part.size(), by);
}

DiffedScripts diffed(const std::string& before, const std::string& after) {
  return {{naive::test::script(before), smallWindow()},
          {naive::test::script(after), smallWindow()}};
}

DiffedScripts diffedTo(const std::string& after) { return diffed(original, after); }

/// Returns the report without the first line.
std::string report(const DiffedScripts& scripts) {
  const std::string text = scripts.text();
  return text.substr(text.find('\n') + 1);
}

TEST(Diff, OfTheSameIsNothing) {
  const auto same = diffed(original, original);
  EXPECT_TRUE(same.changes().empty());
  EXPECT_EQ(same.text(), "old.plist → new.plist\nno difference for users\n");
}

TEST(Diff, OfTheSameInOtherWordsIsNothing) {
  const auto same = diffedTo(R"({
    0 = ((SET_TAG_FOR_OBJECT_ID, 5, 2), (PROCESS_COMMANDS_FOR_ID, 9));
    9 = ((HIDE_OBJECT_WITH_ID, 1), (SET_TEXT_FOR_OBJECT_ID, Hello, 1), (SHOW_OBJECT_WITH_ID, 1));
    5 = ((SET_TEXT_FOR_OBJECT_ID, Bye, 1), (SET_TAG_FOR_OBJECT_ID, 6, 5), (SET_TIMER_FOR_ID, 5, 6));
    3 = ();
    6 = (TERMINATE_PARSER);
  })");
  EXPECT_TRUE(same.changes().empty()) << same.text();
  EXPECT_TRUE(same.json()["same"]);
}

TEST(Diff, SaysWordsApartFromBehavior) {
  const auto found = diffedTo(changed("Bye", "Goodbye"));
  EXPECT_EQ(report(found), R"(
Words
  text field 1: text “Goodbye” instead of “Bye”, at the step of list “2” (“Goodbye”), and at 1 other step
    before: play old --start 0 --press 2
    now: play new --start 0 --press 2

0 changes of behaviour and looks, 1 of words
)");
}

TEST(Diff, GoesOnBehindWhatLooksDifferent) {
  const auto found = diffedTo(R"({
    0 = ((SET_TEXT_FOR_OBJECT_ID, Welcome, 1));
    2 = ((SET_TEXT_FOR_OBJECT_ID, Bye, 1), (SET_TAG_FOR_OBJECT_ID, 20, 2), (SET_TIMER_FOR_ID, 6, 7));
    3 = (); 7 = (TERMINATE_PARSER); 20 = (TERMINATE_PARSER);
  })");
  ASSERT_EQ(found.changes().size(), 2U) << found.text();
  EXPECT_EQ(found.changes()[0].kind, Kind::wait);
  EXPECT_EQ(found.changes()[0].seconds.before, 5.0);
  EXPECT_EQ(found.changes()[0].seconds.after, 6.0);
  EXPECT_EQ(found.changes()[1].kind, Kind::look);
}

TEST(Diff, SaysThatAWaitIsGone) {
  const auto found = diffedTo(changed(", (SET_TIMER_FOR_ID, 5, 7)", ""));
  EXPECT_NE(report(found).find("the wait at the step of list “2” (“Bye”): none instead of 5 s"),
            std::string::npos)
      << found.text();
}

/// Returns the first change of a kind.
const Change& changeOf(const DiffedScripts& scripts, Kind kind) {
  const auto& changes = scripts.changes();
  const auto found = std::find_if(changes.begin(), changes.end(),
                                  [&](const Change& each) { return each.kind == kind; });
  if (found == changes.end()) throw std::runtime_error("no such change:\n" + scripts.text());
  return *found;
}

TEST(Diff, FindsWhatIsGoneAndWhatIsNew) {
  const std::string longer = R"({
    0 = ((SET_TEXT_FOR_OBJECT_ID, Hello, 1), (SET_TAG_FOR_OBJECT_ID, 19, 2));
    19 = ((SET_TEXT_FOR_OBJECT_ID, "Are you sure?", 1), (SET_TAG_FOR_OBJECT_ID, 2, 19), (HIDE_OBJECT_WITH_ID, 3));
    2 = ((SET_TEXT_FOR_OBJECT_ID, Bye, 1), (SET_TAG_FOR_OBJECT_ID, 20, 2), (SHOW_OBJECT_WITH_ID, 3),
         (SET_TIMER_FOR_ID, 5, 7));
    3 = (); 7 = (TERMINATE_PARSER); 20 = (TERMINATE_PARSER);
  })";
  const auto found = diffedTo(longer);
  EXPECT_EQ(report(found), R"(
Behaviour and looks
  new: the step of list “19” (“Are you sure?”)
    now: play new --start 0 --press 19
  a press of button 2 at the step of list “0” (“Hello”) leads to the step of list “19” (“Are you sure?”) instead of the step of list “2” (“Bye”), and at 1 other step
    there: text field 1: text “Are you sure?” instead of “Bye”
    there: check box 3: no longer shown
    before: play old --start 0 --press 2
    now: play new --start 0 --press 19

2 changes of behaviour and looks, 0 of words
)");
  const auto back = diffed(longer, original);
  const Change& gone = changeOf(back, Kind::goneStep);
  EXPECT_EQ(gone.step.before.words(), "the step of list “19” (“Are you sure?”)");
  EXPECT_TRUE(gone.path.after.empty());
}

TEST(Diff, FindsAMoveThatLeadsElsewhere) {
  const auto found = diffedTo(changed("3 = ()", "3 = (TERMINATE_PARSER)"));
  const Change& change = changeOf(found, Kind::move);
  EXPECT_EQ(change.pressed, 2U);
  EXPECT_EQ(change.target.after.words(), "the end");
  EXPECT_EQ(change.path.after.size(), 2U);
  EXPECT_TRUE(change.controls.empty());  // nothing is to be seen at an end
}

/// Returns the original with another list in place of the first that a press runs.
DiffedScripts diffedToList19(const std::string& commands) {
  return diffedTo(R"({
    0 = ((SET_TEXT_FOR_OBJECT_ID, Hello, 1), (SET_TAG_FOR_OBJECT_ID, 19, 2));
    19 = ()" + commands +
                  R"(, (SET_TAG_FOR_OBJECT_ID, 20, 19), (SET_TIMER_FOR_ID, 5, 7));
    3 = (); 7 = (TERMINATE_PARSER); 20 = (TERMINATE_PARSER);
  })");
}

TEST(Diff, TakesAStepForTheSameIfNoOtherIsMuchMoreAlike) {
  const auto found =
      diffedToList19("(SET_TEXT_FOR_OBJECT_ID, Goodbye, 1), (SET_TOOL_TIP_FOR_ID, More, 3)");
  ASSERT_EQ(found.changes().size(), 2U) << found.text();
  for (const Change& change : found.changes()) EXPECT_EQ(change.kind, Kind::look);
  EXPECT_EQ(found.changes()[0].controls.front().property.property, "text");
  EXPECT_EQ(found.changes()[1].controls.front().property.property, "tooltip");
}

TEST(Diff, TakesAStepForAnotherIfBothHaveOneThatIsMoreAlike) {
  const auto found = diffedToList19("(SET_TOOL_TIP_FOR_ID, More, 3)");
  const Change& change = changeOf(found, Kind::move);
  EXPECT_EQ(change.target.before.words(), "the step of list “2” (“Bye”)");
  EXPECT_EQ(change.target.after.words(), "the step of list “19” (“Hello”)");
}

TEST(Diff, TakesAStepForAnotherIfOneIsMuchMoreAlikeAndCountsWhatIsDifferent) {
  const auto found = diffedToList19(
      "(SET_TEXT_FOR_OBJECT_ID, Goodbye, 1), (SET_TOOL_TIP_FOR_ID, One, 1),"
      "(SET_TITLE_FOR_OBJECT_ID, Go, 19), (SET_TOOL_TIP_FOR_ID, Two, 19),"
      "(SET_TITLE_FOR_OBJECT_ID, Box, 3), (SET_TOOL_TIP_FOR_ID, Three, 3),"
      "(SET_STATE_ON_FOR_OBJECT_ID, 3)");
  const Change& change = changeOf(found, Kind::move);
  EXPECT_EQ(change.pressed, 1U) << "the button";
  EXPECT_EQ(change.controls.size(), 7U);
  EXPECT_NE(found.text().find("\n    there: 2 other differences\n"), std::string::npos)
      << found.text();
}

TEST(Diff, FindsListsThatRunEachOtherWithoutEnd) {
  const auto found = diffedTo(changed("3 = ()", "3 = ((PROCESS_COMMANDS_FOR_ID, 3))"));
  const Change& change = changeOf(found, Kind::move);
  EXPECT_EQ(change.target.after.words(), "lists that run each other without end");
  EXPECT_FALSE(change.at.after);
}

TEST(Diff, ComparesTheStart) {
  const auto found = diffedTo(changed("0 = (", "0 = (TERMINATE_PARSER, "));
  const Change& start = changeOf(found, Kind::move);
  EXPECT_TRUE(start.isStart);
  EXPECT_EQ(start.target.after.words(), "the end");
  EXPECT_NE(found.text().find("the start leads to the end instead of the step of list “0”"),
            std::string::npos);
}

/// Returns what of the first step looks different if a command is added to it.
std::string lookAfter(const std::string& command) {
  const auto found = diffedTo(changed("Hello, 1)", "Hello, 1), " + command));
  const auto& change = changeOf(found, Kind::look);
  const auto& [property, values, isWords] = change.controls.front().property;
  return factsOf(found.diff(), *change.controls.front().control).words() + ": " + property + " " +
         values.before + ", " + values.after;
}

TEST(Diff, NamesEachProperty) {
  EXPECT_EQ(lookAfter("(HIDE_OBJECT_WITH_ID, 2)"), "button 2: shown yes, no");
  EXPECT_EQ(lookAfter("(DISABLE_OBJECT_WITH_ID, 2)"), "button 2: enabled yes, no");
  EXPECT_EQ(lookAfter("(SET_TOOL_TIP_FOR_ID, More, 2)"), "button 2: tooltip none, “More”");
  EXPECT_EQ(lookAfter("(SET_STATE_ON_FOR_OBJECT_ID, 3)"), "check box 3: state off, on");
  EXPECT_EQ(lookAfter("(SET_BACKGROUND_COLOR_FOR_OBJECT_ID, 1, 2)"),
            "button 2: background none, red");
  EXPECT_EQ(lookAfter("(FLASH_ID, YES, 2), (ALLOW_FLASHING, YES)"), "button 2: flashing no, yes");
}

TEST(Diff, ShowsTheStyleOfTexts) {
  const auto html = [](const std::string& text) {
    return changed(
        "(SET_TEXT_FOR_OBJECT_ID, Hello, 1)",
        "(SET_ATTRIBUTED_STRING_AS_IS_WITH_HTML_WITH_FONT_NAME_WITH_SIZE_FOR_OBJECT_ID, YES, "
        "\"" +
            text + "\", Helvetica, 14, 1)");
  };
  const auto found = diffed(html("Hello you"), html("Hello <b>you</b>"));
  EXPECT_NE(found.text().find("text field 1: style of the text “Hello ”: Times 12; “you”: "
                              "Times 12 bold instead of “Hello you”: Times 12"),
            std::string::npos)
      << found.text();
}

TEST(Diff, ComparesWindows) {
  const Staged before{naive::test::script(original), smallWindow()};
  Staged after = before;
  after.host.title = "Set-up";
  after.host.content.width += 10;
  after.host.controls[0].frame.x = 5;
  after.host.controls[2].kind = ViewKind::button;
  const DiffedScripts found(before, after);
  const std::string text = found.text();
  EXPECT_NE(text.find("the window: title “Set-up” instead of “”"), std::string::npos) << text;
  EXPECT_NE(text.find("the window: size 650 × 480 instead of 640 × 480"), std::string::npos)
      << text;
  EXPECT_NE(text.find("text field 1: frame 100 × 30 at 5, 0 instead of 100 × 30 at 0, 0"),
            std::string::npos)
      << text;
  EXPECT_NE(text.find("check box 3: shown no such control instead of yes"), std::string::npos)
      << text;
  EXPECT_NE(text.find("button 3: shown yes instead of no such control"), std::string::npos) << text;
}

TEST(Diff, KnowsAControlAgainByWhatItSays) {
  Staged before{naive::test::script(original), smallWindow()};
  before.host.controls[2].caption = "Expert";
  Staged after = before;
  std::swap(after.host.controls[0], after.host.controls[2]);
  after.host.controls[0].tag = 4;
  after.script = naive::test::script(changed("3 = ()", "4 = ()"));
  const DiffedScripts found(before, after);
  EXPECT_TRUE(found.changes().empty()) << found.text();
}

TEST(Diff, SaysWhichFindingsCameAndWent) {
  const auto found = diffedTo(changed("3 = ();", ""));
  EXPECT_EQ(report(found), R"(
Findings of check
  came: new.plist: warning: a user can press the button 3, but no list is under that tag: nothing happens, and the press cancels every timer [no-list]
    see it: play new --start 0
  came: new.plist: warning: a press of the button 3, which has no list, cancels the timer that SET_TIMER_FOR_ID starts [timer-lost]
    see it: play new --start 0 --press 2 3

no difference for users; 2 findings came, 0 went
)");
}

TEST(Diff, HasAReportInJson) {
  const auto json = diffedTo(changed("Bye", "Goodbye")).json();
  EXPECT_EQ(json["version"], 1);
  EXPECT_EQ(json["old"]["script"], "old.plist");
  EXPECT_TRUE(json["complete"]);
  EXPECT_FALSE(json["same"]);
  EXPECT_TRUE(json["behavior"].empty());
  EXPECT_EQ(json["words"], nlohmann::json::parse(R"json([{
    "kind": "look",
    "control": {"kind": "NSTextField", "tag": 1, "index": 0},
    "property": "text", "old": "“Bye”", "new": "“Goodbye”",
    "step": {"old": "the step of list “2” (“Bye”)", "new": "the step of list “2” (“Goodbye”)"},
    "path": {"old": [{"start": "0"}, {"press": 2}], "new": [{"start": "0"}, {"press": 2}]},
    "steps": 2}])json"));
}

}  // namespace
}  // namespace qz::tools::diff
