// SPDX-License-Identifier: MIT
// What users would notice.
#include "tools/comparison/comparison.hpp"

#include <gtest/gtest.h>

#include "tests/check/small_scripts.hpp"

namespace qz::tools::comparison {
namespace {

using drivers::ViewKind;
using Kind = Difference::Kind;

Played played(const std::string& script) {
  Played played{.script = naive::test::script(script),
                .plan = {},
                .resources = QZ_SOURCE_DIR "/examples/first-steps",
                .startKeys = {"0"}};
  played.plan.host =
      naive::test::window({{ViewKind::textField, 1}, {ViewKind::button, 2}, {ViewKind::toggle, 3}});
  return played;
}

std::vector<Difference> differences(const std::string& before, const std::string& after,
                                    std::size_t most = 1) {
  check::Looks looks;
  const Behavior one(played(before), looks, {}, 1, {});
  const Behavior other(played(after), looks, {}, 1, {});
  return compare(one, other, most);
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

TEST(Comparison, OfTheSameIsNothing) { EXPECT_TRUE(differences(original, original).empty()); }

TEST(Comparison, DoesNotSeeTagsAndLists) {
  EXPECT_TRUE(differences(original, R"({
    0 = ((SET_TAG_FOR_OBJECT_ID, 5, 2), (PROCESS_COMMANDS_FOR_ID, 9));
    9 = ((HIDE_OBJECT_WITH_ID, 1), (SET_TEXT_FOR_OBJECT_ID, Hello, 1), (SHOW_OBJECT_WITH_ID, 1));
    5 = ((SET_TEXT_FOR_OBJECT_ID, Bye, 1), (SET_TAG_FOR_OBJECT_ID, 6, 5), (SET_TIMER_FOR_ID, 5, 6),
         (SET_TIMER_FOR_ID, 8, 3));
    3 = ();
    6 = (TERMINATE_PARSER);
  })")
                  .empty());
}

TEST(Comparison, FindsAnotherTextWithItsPath) {
  const auto found = differences(original, changed("Bye", "Gone"));
  ASSERT_EQ(found.size(), 1U);
  EXPECT_EQ(found[0].kind, Kind::look);
  EXPECT_EQ(found[0].control, 0U);
  EXPECT_EQ(found[0].words, "the text “Gone” instead of the text “Bye”");
  EXPECT_EQ(found[0].path, std::vector<Move>{1});
}

TEST(Comparison, FindsAnotherWait) {
  const auto found = differences(original, changed("5, 7", "6, 7"));
  ASSERT_EQ(found.size(), 1U);
  EXPECT_EQ(found[0].kind, Kind::wait);
  EXPECT_EQ(found[0].words, "a wait of 6 s instead of a wait of 5 s");
}

TEST(Comparison, FindsAnEndThatIsMissing) {
  const auto found = differences(original, changed("7 = (TERMINATE_PARSER)", "7 = ()"));
  ASSERT_EQ(found.size(), 1U);
  EXPECT_EQ(found[0].kind, Kind::end);
  EXPECT_EQ(found[0].path, (std::vector<Move>{1, check::waitMove}));
}

TEST(Comparison, FindsListsThatRunWithoutEnd) {
  const auto found = differences(
      original, changed("7 = (TERMINATE_PARSER)", "7 = ((PROCESS_COMMANDS_FOR_ID, 7))"));
  ASSERT_EQ(found.size(), 1U);
  EXPECT_EQ(found[0].kind, Kind::hang);
  EXPECT_FALSE(found[0].after.has_value());
}

TEST(Comparison, FindsAStateThatTheUserMadeAndTheScriptKeeps) {
  const std::string sets = changed("Bye, 1)", "Bye, 1), (SET_STATE_OFF_FOR_OBJECT_ID, 3)");
  const auto found = differences(original, sets);
  ASSERT_EQ(found.size(), 1U);
  EXPECT_EQ(found[0].control, 2U);
  EXPECT_EQ(found[0].path, (std::vector<Move>{2, 1}));
}

TEST(Comparison, FindsEachDifferenceUpToTheLimit) {
  const std::string other = changed("Hello", "Welcome");
  EXPECT_EQ(differences(original, other, 10).size(), 1U);  // nothing behind it is looked at
  EXPECT_EQ(differences(original, changed("5, 7", "6, 7"), 10).size(), 2U);
}

TEST(Comparison, NamesThePathByTheTagsOfEach) {
  check::Looks looks;
  const Behavior behavior(played(original), looks, {}, 1, {});
  const auto path = pathIn(behavior, {1, 1});
  ASSERT_EQ(path.size(), 3U);
  EXPECT_EQ(std::get<check::StartMove>(path[0]).key, "0");
  EXPECT_EQ(std::get<check::PressMove>(path[1]).tag, 2);
  EXPECT_EQ(std::get<check::PressMove>(path[2]).tag, 20);
}

TEST(Comparison, FindsAnotherBackground) {
  const auto found =
      differences(original, changed("Hello, 1)", "Hello, 1), (LOAD_BACKGROUND_WITH_IMAGE, disk)"));
  ASSERT_EQ(found.size(), 1U);
  EXPECT_EQ(found[0].kind, Kind::look);
  EXPECT_FALSE(found[0].control.has_value());
  EXPECT_EQ(found[0].words, "the picture “disk” instead of no picture");
}

}  // namespace
}  // namespace qz::tools::comparison
