// SPDX-License-Identifier: MIT
// The check and the second opinion agree on generated scripts: on every place, on the number of
// moves, on every finding that needs exploring, and on the length of each shortest path.
// Environment variables choose other scripts, and more of them: QZ_FIRST_SEED and QZ_SCRIPTS.

#include <gtest/gtest.h>

#include "tests/check/both_opinions.hpp"
#include "tests/check/generated_scripts.hpp"

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

}  // namespace
}  // namespace qz::tools::check::opinions
