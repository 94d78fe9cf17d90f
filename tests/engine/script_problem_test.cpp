// SPDX-License-Identifier: MIT
// The problems reported for scripts that a host should not play.
#include "qz/script_problem.hpp"

#include <gtest/gtest.h>

#include "qz/property_list/reader.hpp"

namespace qz {

namespace {

TEST(ScriptProblem, SaysWhatIsWrong) {
  const struct {
    const char* script;
    const char* problem;
  } cases[] = {
      {"{ 1 = (IDLE_LOOP); }", ""},
      {"{ 1 = (IDLE_LOOP); about = text; \"-3\" = (); }", ""},
      {"{ 1 = (IDLE_LOOP); 2 = text; }", ""},
      {"{ 4294967303 = (IDLE_LOOP); }", ""},
      {"{}", "no key is a tag (a whole decimal number)"},
      {"{ start = (IDLE_LOOP); 007 = (); }", "no key is a tag (a whole decimal number)"},
      {"{ 1 = (IDLE_LOOP); \"-3\" = text; }",
       "the value under the smallest tag, -3, is not a list"},
      {"{ 1 = (); 2 = ((PROCESS_COMMANDS_FOR_ID, 3)); 3 = ((PROCESS_COMMANDS_FOR_ID, 2));"
       "  4 = (PROCESS_COMMANDS_FOR_ID); }",
       "lists run each other endlessly: 2 -> 3 -> 2, 4 -> 4"},
  };
  for (const auto& c : cases) {
    EXPECT_EQ(problemOf(toolkit::dictionaryFromPropertyList(c.script)), c.problem) << c.script;
  }
}

}  // namespace

}  // namespace qz
