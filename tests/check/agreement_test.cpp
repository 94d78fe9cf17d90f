// SPDX-License-Identifier: MIT
// The check and the second opinion agree on generated scripts: on every place, on the number of
// moves, on every finding that needs exploring, and on the length of each shortest path.
// Environment variables choose other scripts, and more of them: QZ_FIRST_SEED and QZ_SCRIPTS.

#include <gtest/gtest.h>

#include <algorithm>

#include "tests/check/both_opinions.hpp"
#include "tests/check/generated_scripts.hpp"
#include "tests/check/small_scripts.hpp"

namespace qz::tools::check::opinions {
namespace {

constexpr std::size_t placesOfAScript = 300;  // more take the second opinion too long
constexpr std::size_t mostDisagreements = 10;

TEST(Agreement, OnGeneratedScripts) {
  const std::uint64_t first = numberInEnvironment("QZ_FIRST_SEED").value_or(1);
  const std::uint64_t count = numberInEnvironment("QZ_SCRIPTS").value_or(200);
  std::size_t compared = 0;
  std::size_t disagreements = 0;
  for (std::uint64_t seed = first; seed < first + count; ++seed) {
    const naive::Generated generated = naive::generate(seed);
    if (startKeyOf(Script(generated.script)).empty()) continue;
    const BothOpinions opinions({generated.script, generated.host, "/"}, placesOfAScript);
    if (!opinions.theirs.complete) continue;
    ++compared;
    if (opinions.agree()) continue;
    ADD_FAILURE() << "seed " << seed << "\n" << opinions.words() << generated.script->description();
    if (++disagreements == mostDisagreements) break;
  }
  EXPECT_GT(compared, count / 2) << "too few scripts were small enough to compare";
}

// The box becomes 10 by the list 3 and 9 again by each step. It can be left as 10 only behind the
// last step, where the check has seen the press that does so twice.
TEST(Agreement, OnWhoGaveATagByAPressThatWasMadeBefore) {
  using drivers::ViewKind;
  const naive::StagedScript staged{
      naive::test::script(
          "{1=((HIDE_OBJECT_WITH_ID,8)); 3=((SET_TAG_FOR_OBJECT_ID,10,9)); 8=(TERMINATE_PARSER);"
          " 4=((SET_TAG_FOR_OBJECT_ID,9,10),(SET_TAG_FOR_OBJECT_ID,5,4));"
          " 5=((SET_TAG_FOR_OBJECT_ID,9,10),(SET_TAG_FOR_OBJECT_ID,6,5));"
          " 6=((SET_TAG_FOR_OBJECT_ID,9,10),(SHOW_OBJECT_WITH_ID,8),(HIDE_OBJECT_WITH_ID,6));}"),
      naive::test::window({{ViewKind::button, 3},
                           {ViewKind::button, 4},
                           {ViewKind::button, 8},
                           {ViewKind::box, 9}}),
      "/"};
  const BothOpinions opinions(staged, placesOfAScript);
  EXPECT_TRUE(opinions.agree()) << opinions.words();
  const naive::Finding left{"tag-left", "3", 0, 9, 6};
  EXPECT_NE(std::find(opinions.explored.begin(), opinions.explored.end(), left),
            opinions.explored.end())
      << opinions.words();
}

}  // namespace
}  // namespace qz::tools::check::opinions
