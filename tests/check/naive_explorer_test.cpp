// SPDX-License-Identifier: MIT
// The naive explorer on small scripts whose answers are known.
#include "tests/check/naive_explorer.hpp"

#include <gtest/gtest.h>

#include <ostream>
#include <string>
#include <string_view>
#include <vector>

#include "tests/check/small_scripts.hpp"
#include "tools/walkthrough/host_window.hpp"

namespace qz::naive {

static void PrintTo(const Finding& finding, std::ostream* out) {
  *out << finding.code << " list " << finding.list << " element "
       << (finding.element ? std::to_string(*finding.element) : "-") << " tag "
       << (finding.tag ? std::to_string(*finding.tag) : "-") << " path " << finding.pathLength;
}

namespace test {
namespace {

constexpr auto button = drivers::ViewKind::button;
constexpr auto toggle = drivers::ViewKind::toggle;
constexpr auto field = drivers::ViewKind::textField;
constexpr auto box = drivers::ViewKind::box;

constexpr auto none = std::nullopt;
constexpr std::size_t noLimit = 1000;

std::vector<Finding> findingsOf(const Exploration& exploration, std::string_view code) {
  std::vector<Finding> found;
  for (const Finding& finding : exploration.findings) {
    if (finding.code == code) found.push_back(finding);
  }
  return found;
}

/// A script with exactly these findings of their code, and one without any.
struct Case {
  tools::walkthrough::HostWindow host;
  std::string_view wrong;
  std::vector<Finding> findings;
  std::string_view right;
};

void expect(const Case& row) {
  const std::string code = row.findings.front().code;
  SCOPED_TRACE(code + " in " + std::string(row.wrong));
  const auto wrong = explore(script(row.wrong), row.host, {}, noLimit);
  EXPECT_EQ(findingsOf(wrong, code), row.findings);
  const auto right = explore(script(row.right), row.host, {}, noLimit);
  EXPECT_EQ(findingsOf(right, code), std::vector<Finding>()) << "in " << row.right;
}

TEST(NaiveExplorer, FindsListsThatRunEachOtherEndlessly) {
  const Case cases[] = {
      {window({{button, 2}}),
       "{1=(IDLE_LOOP); 2=((PROCESS_COMMANDS_FOR_ID,3)); "
       "3=(IDLE_LOOP,(PROCESS_COMMANDS_FOR_ID,2));}",
       {{"endless-chain", "3", 1, none, 2}},
       "{1=(IDLE_LOOP); 2=((PROCESS_COMMANDS_FOR_ID,3)); 3=(IDLE_LOOP);}"},
      {window({}),
       "{1=(PROCESS_COMMANDS_FOR_ID);}",
       {{"endless-chain", "1", 0, none, 1}},
       // After the end there is no script, and so no list.
       "{1=((PROCESS_COMMANDS_FOR_ID,2),PROCESS_COMMANDS_FOR_ID); 2=(TERMINATE_PARSER);}"},
  };
  for (const Case& row : cases) expect(row);
}

TEST(NaiveExplorer, FindsExceptionsThatReadingDoesNotSay) {
  expect(
      {window({{box, 7}, {field, 8}}),
       "{1=((HIDE_OBJECT_WITH_ID,7),(DISABLE_OBJECT_WITH_ID,7));}",
       {{"raises", "1", 1, 7, 1}},
       "{1=((DISABLE_OBJECT_WITH_ID,8),(SET_TITLE_FOR_OBJECT_ID,x),(SET_TEXT_FOR_OBJECT_ID,x,()),"
       "());}"});
}

TEST(NaiveExplorer, FindsDeadEndsAndTraps) {
  const Case cases[] = {
      {window({{button, 2}}),
       "{1=(IDLE_LOOP); 2=(HIDE_OBJECT_WITH_ID);}",
       {{"dead-end", "2", none, none, 2}},
       "{1=(IDLE_LOOP); 2=(TERMINATE_PARSER);}"},
      // The press of a button without a list loses the only way on.
      {window({{button, 2}}),
       "{1=((SET_TIMER_FOR_ID,3,4)); 4=(TERMINATE_PARSER);}",
       {{"dead-end", "", none, 2, 2}},
       "{1=((SET_TIMER_FOR_ID,3,4)); 2=((SET_TIMER_FOR_ID,3,4)); 4=(TERMINATE_PARSER);}"},
      {window({{button, 2}, {button, 3}}),
       "{1=(IDLE_LOOP); 2=(TERMINATE_PARSER); 3=((HIDE_OBJECT_WITH_ID,2));}",
       {{"trap", "3", none, none, 2}},
       "{1=(IDLE_LOOP); 2=(TERMINATE_PARSER); 3=((HIDE_OBJECT_WITH_ID,3));}"},
      {window({{button, 2}, {button, 3}}),
       "{1=(IDLE_LOOP); 2=(IDLE_LOOP);}",
       {{"no-end", "", none, none, 0}},
       "{1=(IDLE_LOOP); 2=(TERMINATE_PARSER);}"},
  };
  for (const Case& row : cases) expect(row);
}

TEST(NaiveExplorer, FindsOneTrapForEachSetOfPlaces) {
  // 3 and 4 each leave one button besides themselves, which cannot end either.
  const auto host = window({{button, 2}, {button, 3}, {button, 4}});
  const auto found = explore(script("{1=(IDLE_LOOP); 2=(TERMINATE_PARSER);"
                                    " 3=((HIDE_OBJECT_WITH_ID,2),(DISABLE_OBJECT_WITH_ID,4));"
                                    " 4=((HIDE_OBJECT_WITH_ID,2),(DISABLE_OBJECT_WITH_ID,3));}"),
                             host, {}, noLimit);
  const std::vector<Finding> traps = {{"trap", "3", none, none, 2}, {"trap", "4", none, none, 2}};
  EXPECT_EQ(findingsOf(found, "trap"), traps);
  EXPECT_EQ(findingsOf(found, "dead-end"), std::vector<Finding>());
}

TEST(NaiveExplorer, FindsCommandsWithoutTheirControls) {
  const Case cases[] = {
      {window({{field, 5}}),
       "{1=((HIDE_OBJECT_WITH_ID,9),(SET_TIMER_FOR_ID,1,8),(SET_TIMER_FOR_ID,1,1));}",
       {{"no-target", "1", 0, 9, 1}, {"no-target", "1", 1, 8, 1}},
       "{1=((HIDE_OBJECT_WITH_ID,5),(SET_TIMER_FOR_ID,1,5));}"},
      // The first press finds the field 9, the second does not.
      {window({{button, 2}, {field, 9}}),
       "{1=(IDLE_LOOP); 2=((HIDE_OBJECT_WITH_ID,9),(SET_TAG_FOR_OBJECT_ID,8,9));}",
       {{"no-target", "2", 0, 9, 3}, {"no-target", "2", 1, 9, 3}},
       "{1=(IDLE_LOOP); 2=((HIDE_OBJECT_WITH_ID,9),(SET_TAG_FOR_OBJECT_ID,9,9));}"},
      {window({{field, 5}, {button, 6}, {toggle, 7}}),
       "{1=((SET_TITLE_FOR_OBJECT_ID,x,5),(SET_STATE_ON_FOR_OBJECT_ID,6));}",
       {{"wrong-target", "1", 0, 5, 1}, {"wrong-target", "1", 1, 6, 1}},
       "{1=((SET_TITLE_FOR_OBJECT_ID,x,6),(SET_STATE_ON_FOR_OBJECT_ID,7));}"},
      {window({{field, 5}, {field, 5}, {field, 6}}),
       "{1=((SET_TEXT_FOR_OBJECT_ID,a,5));}",
       {{"same-tag", "1", 0, 5, 1}},
       "{1=((SET_TEXT_FOR_OBJECT_ID,a,6));}"},
  };
  for (const Case& row : cases) expect(row);
}

TEST(NaiveExplorer, FindsPressesOfOneOfTwoButtonsWithOneTag) {
  expect({window({{button, 3}, {button, 3}}),
          "{1=(IDLE_LOOP); 3=(IDLE_LOOP);}",
          {{"same-tag", "", none, 3, 2}},
          "{1=(TERMINATE_PARSER); 3=(IDLE_LOOP);}"});
}

TEST(NaiveExplorer, FindsListsThatAreMissingOrIdle) {
  const Case cases[] = {
      {window({}),
       "{1=(IDLE_LOOP); 9=(IDLE_LOOP);}",
       {{"never-runs", "9", none, none, 0}},
       "{1=((PROCESS_COMMANDS_FOR_ID,9)); 9=();}"},
      {window({{button, 2}, {button, 3}}),
       "{1=((HIDE_OBJECT_WITH_ID,2)); 3=((SHOW_OBJECT_WITH_ID,2));}",
       {{"no-list", "", none, 2, 2}},
       "{1=((HIDE_OBJECT_WITH_ID,2)); 3=(IDLE_LOOP);}"},
      {window({{button, 2}}),
       "{1=((FLASH_ID,YES,2),(FLASH_ID,NO,2));}",
       {{"flash-decided", "1", 1, 2, 1}},
       "{1=((FLASH_ID,YES,2),(FLASH_ID,NO,3));}"},
  };
  for (const Case& row : cases) expect(row);
}

TEST(NaiveExplorer, FindsTimersThatAreLost) {
  const Case cases[] = {
      {window({{button, 3}}),
       "{1=((SET_TIMER_FOR_ID,5,4)); 4=(IDLE_LOOP);}",
       {{"timer-lost", "1", 0, 3, 2}},
       "{1=((SET_TIMER_FOR_ID,5,4)); 3=(IDLE_LOOP); 4=(IDLE_LOOP);}"},
      {window({}),
       "{1=((SET_TIMER_FOR_ID,2,4),(SET_TIMER_FOR_ID,9,5)); 4=(IDLE_LOOP); 5=(IDLE_LOOP);}",
       {{"never-fires", "1", 1, 5, 1}},
       "{1=((SET_TIMER_FOR_ID,2,4)); 4=((SET_TIMER_FOR_ID,9,5)); 5=(IDLE_LOOP);}"},
      {window({}),
       "{1=((SET_TIMER_FOR_ID,2,4),(SET_TIMER_FOR_ID,2,5)); 4=(IDLE_LOOP); 5=(IDLE_LOOP);}",
       {{"never-fires", "1", 1, 5, 1}},
       "{1=((SET_TIMER_FOR_ID,2,4)); 4=(TERMINATE_PARSER);}"},
      {window({}),
       "{1=((SET_TIMER_FOR_ID,2,4),(SET_TIMER_FOR_ID,3,4)); 4=(IDLE_LOOP);}",
       {{"never-fires", "1", 0, 4, 1}},
       "{1=((SET_TIMER_FOR_ID,2,4)); 4=((SET_TIMER_FOR_ID,3,4));}"},
  };
  for (const Case& row : cases) expect(row);
}

// Who started a timer is not part of the place, nor who re-tagged a control: 2 and 3 do the same,
// and 7 has the last word after both.
TEST(NaiveExplorer, BlamesEveryListThatLeadsToAPlace) {
  const auto found =
      explore(script("{1=(IDLE_LOOP); 4=(IDLE_LOOP); 5=(TERMINATE_PARSER); 7=(IDLE_LOOP);"
                     " 2=((SET_TIMER_FOR_ID,5,4),(SET_TAG_FOR_OBJECT_ID,10,9),"
                     "    (PROCESS_COMMANDS_FOR_ID,7));"
                     " 3=((SET_TIMER_FOR_ID,5,4),(SET_TAG_FOR_OBJECT_ID,10,9),"
                     "    (SET_TIMER_FOR_ID,6,5),(SET_TIMER_FOR_ID,0,5),"
                     "    (PROCESS_COMMANDS_FOR_ID,7));}"),
              window({{button, 2}, {button, 3}, {button, 5}, {button, 6}, {box, 9}}), {}, noLimit);
  EXPECT_EQ(findingsOf(found, "never-fires"), std::vector<Finding>());
  const std::vector<Finding> lost = {{"timer-lost", "2", 0, 6, 3}, {"timer-lost", "3", 0, 6, 3}};
  EXPECT_EQ(findingsOf(found, "timer-lost"), lost);
  const std::vector<Finding> tags = {{"tag-left", "2", 1, 9, 3}, {"tag-left", "3", 1, 9, 3}};
  EXPECT_EQ(findingsOf(found, "tag-left"), tags);
}

TEST(NaiveExplorer, FindsPlacesThatLookDifferent) {
  const Case cases[] = {
      {window({{button, 2}, {button, 3}, {field, 5}}),
       "{1=(IDLE_LOOP); 2=((SET_TEXT_FOR_OBJECT_ID,a,5)); 3=((ALLOW_FLASHING,NO));}",
       {{"looks-differ", "3", none, 5, 3}},
       "{1=(IDLE_LOOP); 2=((SET_TEXT_FOR_OBJECT_ID,a,5)); 3=((SET_TEXT_FOR_OBJECT_ID,b,5));}"},
      // The difference comes up two presses after its cause, at a place that is known by then.
      {window({{button, 2}, {button, 3}, {field, 5}}),
       "{1=((SET_TEXT_FOR_OBJECT_ID,a,5)); 2=((SET_TEXT_FOR_OBJECT_ID,b,5));"
       " 3=((HIDE_OBJECT_WITH_ID,5),(SET_TAG_FOR_OBJECT_ID,4,3)); 4=((SHOW_OBJECT_WITH_ID,5));}",
       {{"looks-differ", "4", none, 5, 4}},
       "{1=((SET_TEXT_FOR_OBJECT_ID,a,5)); 2=((SET_TEXT_FOR_OBJECT_ID,b,5));"
       " 3=((HIDE_OBJECT_WITH_ID,5));}"},
      // A check box that the user has set does not count; one that the script has set does.
      {window({{toggle, 2}, {button, 3}, {button, 4}}),
       "{1=(IDLE_LOOP); 2=(IDLE_LOOP); 3=((SET_STATE_ON_FOR_OBJECT_ID,2)); 4=(IDLE_LOOP);}",
       {{"looks-differ", "4", none, 2, 3}},
       "{1=(IDLE_LOOP); 2=(IDLE_LOOP); 3=(IDLE_LOOP); 4=(IDLE_LOOP);}"},
      {window({{button, 2}, {button, 3}, {button, 4}}),
       "{1=((ALLOW_FLASHING,YES)); 2=(IDLE_LOOP); 3=((FLASH_ID,YES,4)); 4=(IDLE_LOOP);}",
       {{"looks-differ", "2", none, 4, 3}, {"looks-differ", "4", none, 4, 3}},
       "{1=(IDLE_LOOP); 2=(IDLE_LOOP); 3=((FLASH_ID,YES,4)); 4=(IDLE_LOOP);}"},
  };
  for (const Case& row : cases) expect(row);
}

TEST(NaiveExplorer, FindsTextsThatNobodyCanRead) {
  const Case cases[] = {
      {window({{field, 5}}),
       "{1=((SET_TEXT_FOR_OBJECT_ID,a,5),(SET_TIMER_FOR_ID,1,4)); "
       "4=((SET_TEXT_FOR_OBJECT_ID,b,5));}",
       {{"too-brief", "1", 1, 5, 2}},
       "{1=((SET_TEXT_FOR_OBJECT_ID,a,5),(SET_TIMER_FOR_ID,2,4)); "
       "4=((SET_TEXT_FOR_OBJECT_ID,b,5));}"},
      // Ten words take three seconds; the second wait is long enough together with the first.
      {window({{field, 5}}),
       "{1=((SET_TEXT_FOR_OBJECT_ID,'a b c d e f g h i j',5),(SET_TIMER_FOR_ID,2,4));"
       " 4=((SET_TEXT_FOR_OBJECT_ID,b,5));}",
       {{"too-brief", "1", 1, 5, 2}},
       "{1=((SET_TEXT_FOR_OBJECT_ID,'a b c d e f g h i j',5),(SET_TIMER_FOR_ID,2,3));"
       " 3=((SET_TIMER_FOR_ID,1,4)); 4=((SET_TEXT_FOR_OBJECT_ID,b,5));}"},
  };
  for (const Case& row : cases) expect(row);
}

TEST(NaiveExplorer, FindsWhatIsLeftAfterTheEnd) {
  const Case cases[] = {
      {window({{box, 7}, {button, 2}, {field, 5}}),
       "{1=((SET_TAG_FOR_OBJECT_ID,8,7)); 2=(TERMINATE_PARSER);}",
       {{"tag-left", "1", 0, 7, 2}},
       "{1=((SET_TAG_FOR_OBJECT_ID,8,5)); 2=(TERMINATE_PARSER);}"},
      {window({{button, 2}, {field, 5}}),
       "{1=(IDLE_LOOP); 2=(TERMINATE_PARSER,(SET_TAG_FOR_OBJECT_ID,8,5));}",
       {{"tag-left", "2", 1, 5, 2}},
       "{1=(IDLE_LOOP); 2=((SET_TAG_FOR_OBJECT_ID,8,5),TERMINATE_PARSER);}"},
      {window({{toggle, 2}, {field, 5}, {field, 6}}),
       "{1=((SET_TEXT_FOR_OBJECT_ID,a,5),(HIDE_OBJECT_WITH_ID,6)); 2=(TERMINATE_PARSER);}",
       {{"left-behind", "2", none, 5, 2}, {"left-behind", "2", none, 6, 2}},
       "{1=((SET_TEXT_FOR_OBJECT_ID,'',5)); 2=(TERMINATE_PARSER);}"},
  };
  for (const Case& row : cases) expect(row);
}

TEST(NaiveExplorer, KnowsEveryPlace) {
  const auto found = explore(script("{1=((SET_TIMER_FOR_ID,5,4),(SET_TIMER_FOR_ID,3,2));"
                                    " 2=((DISABLE_OBJECT_WITH_ID,2)); 4=(TERMINATE_PARSER);}"),
                             window({{field, 9}, {button, 2}, {button, 4}}), {}, noLimit);
  const std::set<std::string> places = {
      "NSTextField:9:shown:enabled;NSButton:2:shown:enabled;NSButton:4:shown:enabled;"
      "window:shown:free;timers:2@3.000000,4@5.000000;script:yes;ended:no",
      "NSTextField:9:shown:enabled;NSButton:2:shown:disabled;NSButton:4:shown:enabled;"
      "window:shown:free;timers:;script:yes;ended:no",
      "NSTextField:9:shown:enabled;NSButton:2:shown:enabled;NSButton:4:shown:enabled;"
      "window:gone:free;timers:;script:no;ended:yes",
      "NSTextField:9:shown:enabled;NSButton:2:shown:disabled;NSButton:4:shown:enabled;"
      "window:gone:free;timers:;script:no;ended:yes",
  };
  EXPECT_EQ(found.places, places);
  EXPECT_EQ(found.presses, 3U);
  EXPECT_EQ(found.waits, 1U);
  EXPECT_TRUE(found.complete);
}

// A negative time and the delay of re-tagging never end: nobody waits for them.
TEST(NaiveExplorer, DoesNotWaitForEver) {
  const auto found =
      explore(script("{1=((SET_TIMER_FOR_ID,-1,9),(SET_TAG_FOR_OBJECT_ID_WITH_TIMER,3,2,5));}"),
              window({{button, 2}, {field, 9}}), {}, noLimit);
  EXPECT_EQ(found.waits, 0U);
  EXPECT_EQ(found.places.count("NSButton:3:shown:enabled;NSTextField:9:shown:enabled;"
                               "window:shown:free;timers:3@inf,9@inf;script:yes;ended:no"),
            1U);
}

TEST(NaiveExplorer, SaysOnlyWhatItKnowsIfALimitStopsIt) {
  const auto found = explore(script("{1=((HIDE_OBJECT_WITH_ID,9)); 2=((HIDE_OBJECT_WITH_ID,3));"
                                    " 3=(HIDE_OBJECT_WITH_ID); 7=(IDLE_LOOP);}"),
                             window({{button, 2}, {button, 3}}), {}, 1);
  EXPECT_FALSE(found.complete);
  EXPECT_EQ(found.places.size(), 1U);
  EXPECT_EQ(found.findings, std::vector<Finding>());
}

TEST(NaiveExplorer, ExploresEveryStart) {
  const auto host = window({{field, 5}});
  const auto text = script("{1=((HIDE_OBJECT_WITH_ID,5)); 3=((SHOW_OBJECT_WITH_ID,5));}");
  EXPECT_EQ(explore(text, host, {}, noLimit).places.size(), 1U);
  EXPECT_EQ(explore(text, host, {"3", "1"}, noLimit).places.size(), 2U);
  EXPECT_EQ(findingsOf(explore(text, host, {"3", "1"}, noLimit), "never-runs").size(), 0U);
}

}  // namespace
}  // namespace test
}  // namespace qz::naive
