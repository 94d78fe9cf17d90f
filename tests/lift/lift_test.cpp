// SPDX-License-Identifier: MIT
// What lift writes, and what it refuses.
#include <gtest/gtest.h>

#include "tests/check/small_scripts.hpp"
#include "tests/lift/lifted_script.hpp"
#include "tools/lift/styled_text.hpp"

namespace qz::tools::lift {
namespace {

using drivers::ViewKind;

constexpr std::size_t mostSmallPairs = 200;

LiftedScript lift(const std::string& script) {
  return {naive::test::script(script),
          naive::test::window({{ViewKind::textField, 1},
                               {ViewKind::button, 2},
                               {ViewKind::button, 3},
                               {ViewKind::toggle, 4}}),
          QZ_SOURCE_DIR "/examples/first-steps"};
}

/// Returns the source, or why there is none. What was lifted is the same for users.
std::string sourceOf(const std::string& script) {
  const LiftedScript lifted = lift(script);
  if (lifted.refusal()) return *lifted.refusal();
  EXPECT_EQ(lifted.difference(mostSmallPairs), "");
  return lifted.source();
}

TEST(Lifting, NamesStepsByTheirHeadingsAndFindsBack) {
  EXPECT_EQ(sourceOf(R"({
    0 = ((SET_TEXT_FOR_OBJECT_ID, Hello, 1), (SET_TITLE_FOR_OBJECT_ID, Next, 2),
         (SET_TITLE_FOR_OBJECT_ID, Back, 3), (DISABLE_OBJECT_WITH_ID, 3));
    2 = ((SET_TAG_FOR_OBJECT_ID, 12, 2), (SET_TEXT_FOR_OBJECT_ID, Middle, 1), (ENABLE_OBJECT_WITH_ID, 3));
    3 = ((SET_TAG_FOR_OBJECT_ID, 2, 12), (SET_TEXT_FOR_OBJECT_ID, Hello, 1), (DISABLE_OBJECT_WITH_ID, 3));
    12 = ((SET_TAG_FOR_OBJECT_ID, 22, 12), (SET_TEXT_FOR_OBJECT_ID, Last, 1), (SET_TAG_FOR_OBJECT_ID, 13, 3));
    13 = ((SET_TAG_FOR_OBJECT_ID, 12, 22), (SET_TAG_FOR_OBJECT_ID, 3, 13), (SET_TEXT_FOR_OBJECT_ID, Middle, 1));
    22 = (TERMINATE_PARSER);
    4 = ();
  })"),
            R"(window: host.plist
controls: {heading: 1, next: 2, back: 3}
every step: {next: Next, back: {title: Back, press: back}}
steps:
  Hello: {heading: Hello, next: {press: Middle}}
  Middle: {heading: Middle, next: {press: Last}}
  Last: {heading: Last, next: {press: end}}
)");
}

TEST(Lifting, GivesEachStepItsBackground) {
  EXPECT_EQ(sourceOf(R"({
    0 = ((SET_TEXT_FOR_OBJECT_ID, Begin, 1), (LOAD_BACKGROUND_WITH_IMAGE, disk));
    2 = ((SET_TEXT_FOR_OBJECT_ID, Ready, 1), (LOAD_BACKGROUND_WITH_IMAGE, done), (SET_TAG_FOR_OBJECT_ID, 12, 2));
    4 = ();
    12 = (TERMINATE_PARSER);
  })"),
            R"(window: host.plist
controls: {heading: 1, button: 2}
back over: 0
steps:
  Begin: {heading: Begin, button: {press: Ready}, background: disk}
  Ready: {heading: Ready, button: {press: end}, background: done}
)");
}

TEST(Lifting, AWaitThatPressesGiveUpIsGivenUp) {
  EXPECT_EQ(sourceOf(R"({
    0 = ((SET_TEXT_FOR_OBJECT_ID, Wait, 1), (HIDE_OBJECT_WITH_ID, 2), (HIDE_OBJECT_WITH_ID, 3),
         (SET_TIMER_FOR_ID, 5, 9));
    4 = ();
    9 = (TERMINATE_PARSER);
  })"),
            R"(window: host.plist
controls: {heading: 1, button: 2, button 2: 3}
back over: 0
steps:
  Wait: {heading: Wait, after 5 s: {go: end, other presses: give up}}
)");
}

TEST(Lifting, ACheckBoxThatChangesTheWayHasAStepForEachState) {
  EXPECT_EQ(sourceOf(R"({
    0 = ((SET_TEXT_FOR_OBJECT_ID, Choose, 1), (SET_STATE_OFF_FOR_OBJECT_ID, 4));
    4 = ((SET_TAG_FOR_OBJECT_ID, 40, 4), (SET_TAG_FOR_OBJECT_ID, 20, 2));
    40 = ((SET_TAG_FOR_OBJECT_ID, 4, 40), (SET_TAG_FOR_OBJECT_ID, 2, 20));
    2 = ((SET_TEXT_FOR_OBJECT_ID, Plain, 1), (HIDE_OBJECT_WITH_ID, 4), (SET_TAG_FOR_OBJECT_ID, 30, 2));
    20 = ((SET_TEXT_FOR_OBJECT_ID, Encrypted, 1), (HIDE_OBJECT_WITH_ID, 40), (SET_TAG_FOR_OBJECT_ID, 30, 20));
    30 = (TERMINATE_PARSER);
    3 = (TERMINATE_PARSER);
  })"),
            R"(window: host.plist
controls: {heading: 1, button: 2, button 2: 3, button 3: 4}
every step: {button 2: {press: end}, hide: button 3}
back over: 0
steps:
  Choose: {heading: Choose, button: {press: Plain}, button 3: {press: Choose 2}}
  Plain: {heading: Plain, button: {press: end}}
  Choose 2: {heading: Choose, button: {press: Encrypted}, button 3: {press: Choose}}
  Encrypted: {heading: Encrypted, button: {press: end}}
)");
}

TEST(Lifting, SaysWhatTheLanguageCannot) {
  EXPECT_EQ(sourceOf("{ 0 = (); 2 = ((PROCESS_COMMANDS_FOR_ID, 2)); }"),
            "script.plist: list “2”: a press of the tag 2 runs lists without end");
  EXPECT_EQ(sourceOf("{ 0 = (TERMINATE_PARSER); }"),
            "script.plist: list “0”: the walk-through ends at its start");
  EXPECT_EQ(
      sourceOf("{ 0 = ((DISABLE_OBJECT_WITH_ID, 2), (FLASH_ID, YES, 2), (ALLOW_FLASHING, YES)); }"),
      "script.plist: list “0”: the control with the tag 2: it flashes while the user cannot "
      "press it");
}

/// Returns why a script is refused that begins with these commands; the tag 2 ends it.
std::string refusalOf(const std::string& commands, const std::string& lists = "") {
  return sourceOf("{ 0 = (" + commands + "); 2 = (TERMINATE_PARSER); " + lists + " }");
}

TEST(Lifting, SaysWhichWaitsTheLanguageCannotSay) {
  const std::string tooLong =
      "SET_TIMER_FOR_ID: a wait of 700000 s is not a whole number of seconds from 1 to 604800";
  EXPECT_EQ(refusalOf("(SET_TIMER_FOR_ID, 700000, 9)", "9 = (TERMINATE_PARSER);"),
            "script.plist: list “0”: " + tooLong);
  EXPECT_EQ(refusalOf("(SET_TIMER_FOR_ID, 5, 9)", "9 = ((PROCESS_COMMANDS_FOR_ID, 9));"),
            "script.plist: list “9”: a wait runs lists without end");
  // The same without Back, if it is not Back that cannot be said.
  EXPECT_EQ(sourceOf(R"({
    0 = ((SET_TEXT_FOR_OBJECT_ID, Hello, 1), (DISABLE_OBJECT_WITH_ID, 3));
    2 = ((SET_TAG_FOR_OBJECT_ID, 12, 2), (SET_TEXT_FOR_OBJECT_ID, Middle, 1), (ENABLE_OBJECT_WITH_ID, 3));
    3 = ((SET_TAG_FOR_OBJECT_ID, 2, 12), (SET_TEXT_FOR_OBJECT_ID, Hello, 1), (DISABLE_OBJECT_WITH_ID, 3));
    12 = ((SET_TEXT_FOR_OBJECT_ID, Last, 1), (SET_TAG_FOR_OBJECT_ID, 22, 12), (SET_TAG_FOR_OBJECT_ID, 13, 3),
          (SET_TIMER_FOR_ID, 700000, 22));
    13 = ((SET_TAG_FOR_OBJECT_ID, 12, 22), (SET_TAG_FOR_OBJECT_ID, 3, 13), (SET_TEXT_FOR_OBJECT_ID, Middle, 1));
    22 = (TERMINATE_PARSER);
    4 = ();
  })"),
            "script.plist: list “12”: " + tooLong);
}

TEST(Lifting, NamesTheCommandThatMadeALookThatTheLanguageCannotSay) {
  const std::string blamed =
      "script.plist: list “0”: SET_TEXT_FOR_OBJECT_ID: the control with the tag 1: no words of the "
      "language make it look so";
  EXPECT_EQ(refusalOf("(SET_TEXT_FOR_OBJECT_ID, \"  indented\", 1)"), blamed);
  // Those before it are tried too, and must not run a list, wait or end anything meanwhile.
  EXPECT_EQ(
      refusalOf("(PROCESS_COMMANDS_FOR_ID, 1), (SET_TIMER_FOR_ID, 0, 1), HIDE_OBJECT_WITH_ID, "
                "(HIDE_OBJECT_WITH_ID), (SET_TITLE_FOR_OBJECT_ID, Go, 2), "
                "(SET_TEXT_FOR_OBJECT_ID, \"  indented\", 1)",
                "1 = ();"),
      blamed);
}

TEST(Lifting, QuotesWhatYamlWouldMisunderstand) {
  EXPECT_EQ(sourceOf(R"({
    0 = ((SET_TEXT_FOR_OBJECT_ID, "- yes: *no* #1 {a}", 1), (SET_TITLE_FOR_OBJECT_ID, "No", 2),
         (SET_TITLE_FOR_OBJECT_ID, "say \"hi\"", 3),
         (SET_TOOL_TIP_FOR_ID, "two\nlines,\ta tab\U0001", 3));
    2 = (TERMINATE_PARSER);
    3 = (TERMINATE_PARSER);
    4 = ();
  })"),
            R"(window: host.plist
controls: {heading: 1, "no": 2, "say \"hi\"": 3}
back over: 0
steps:
  "- yes: *no* #1 {a}":
    heading: "\\- yes: \\*no\\* \\#1 {a}"
    "no": {title: "No", press: end}
    "say \"hi\"": {title: "say \"hi\"", tooltip: "two\nlines,\ta tab\x01", press: end}
)");
}

TEST(Lifting, AButtonThatInvertsACheckBoxHasAStepForEachState) {
  EXPECT_EQ(sourceOf(R"({
    0 = ((SET_TEXT_FOR_OBJECT_ID, Choose, 1), (SET_STATE_OFF_FOR_OBJECT_ID, 4));
    4 = ((SET_TAG_FOR_OBJECT_ID, 40, 4), (SET_TAG_FOR_OBJECT_ID, 20, 2));
    40 = ((SET_TAG_FOR_OBJECT_ID, 4, 40), (SET_TAG_FOR_OBJECT_ID, 2, 20));
    2 = ((SET_STATE_ON_FOR_OBJECT_ID, 4), (SET_TAG_FOR_OBJECT_ID, 40, 4), (SET_TAG_FOR_OBJECT_ID, 20, 2));
    20 = ((SET_STATE_OFF_FOR_OBJECT_ID, 40), (SET_TAG_FOR_OBJECT_ID, 4, 40), (SET_TAG_FOR_OBJECT_ID, 2, 20));
    3 = (TERMINATE_PARSER);
  })"),
            R"(window: host.plist
controls: {heading: 1, button: 2, button 2: 3, button 3: 4}
every step: {heading: Choose, button 2: {press: end}}
back over: 0
steps:
  Choose: {button: {press: Choose 2}, button 3: {press: Choose 2}}
  Choose 2: {button: {press: Choose}, button 3: {state: on, press: Choose}}
)");
}

TEST(Lifting, WritesColoursBehindTextsAsHtml) {
  toolkit::TextAttributes attributes;
  attributes.backgroundColor = toolkit::Color{1, 1, 0, 1};
  EXPECT_EQ(asHtml(toolkit::AttributedString("Hi", attributes), std::nullopt),
            "<font style=\"background-color: #ffff00\">Hi</font>");
}

}  // namespace
}  // namespace qz::tools::lift
