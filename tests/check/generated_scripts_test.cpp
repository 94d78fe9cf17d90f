// SPDX-License-Identifier: MIT
// The naive explorer on many generated scripts.
#include "tests/check/generated_scripts.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>

#include "tests/check/naive_explorer.hpp"
#include "tests/check/random_walk.hpp"

namespace qz::naive {
namespace {

constexpr std::uint64_t seeds = 300;
constexpr std::size_t limit = 2000;

TEST(GeneratedScripts, HaveThePlantedDefects) {
  const auto codes = codesFoundByExploring();
  for (std::uint64_t seed = 1; seed < seeds; seed += 2) {
    const Generated generated = generate(seed);
    if (std::find(codes.begin(), codes.end(), *generated.planted) == codes.end()) continue;
    const auto found = explore(generated.script, generated.host, {}, limit);
    const bool isFound =
        std::any_of(found.findings.begin(), found.findings.end(),
                    [&](const Finding& finding) { return finding.code == *generated.planted; });
    EXPECT_TRUE(isFound) << *generated.planted << ", seed " << seed << ": "
                         << generated.script->description();
  }
}

TEST(GeneratedScripts, PlantEveryCode) {
  std::set<std::string> planted;
  for (std::uint64_t seed = 0; seed < seeds; ++seed) {
    if (const auto code = generate(seed).planted) planted.insert(*code);
  }
  EXPECT_EQ(planted.size(), codesFoundByReading().size() + codesFoundByExploring().size());
}

TEST(GeneratedScripts, KeepWithinTheirSizes) {
  for (std::uint64_t seed = 0; seed < seeds; ++seed) {
    const Generated generated = generate(seed);
    EXPECT_LE(generated.host.controls.size(), 6U) << seed;
    EXPECT_LE(generated.script->count(), 8U) << seed;
    EXPECT_EQ(generated.script->description(), generate(seed).script->description());
  }
}

TEST(GeneratedScripts, AreWalkedOnlyThroughPlacesThatTheExplorerKnows) {
  for (std::uint64_t seed = 0; seed < seeds; ++seed) {
    const Generated generated = generate(seed);
    const auto found = explore(generated.script, generated.host, {}, limit);
    if (!found.complete) continue;
    RandomWalk walk(generated.script, generated.host, "", seed);
    for (int move = 0; move < 50; ++move) {
      const std::string place = walk.next();
      if (place.empty()) continue;
      ASSERT_EQ(found.places.count(place), 1U) << seed << ": " << place;
    }
  }
}

}  // namespace
}  // namespace qz::naive
