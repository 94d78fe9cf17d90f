// SPDX-License-Identifier: MIT
// What lift makes of generated scripts is no different for users, or lift says why it cannot be.
// Environment variables choose other scripts, and more of them: QZ_FIRST_SEED and QZ_SCRIPTS.

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <iostream>
#include <map>

#include "tests/check/generated_scripts.hpp"
#include "tests/lift/lifted_script.hpp"

namespace qz::tools::lift {
namespace {

using check::opinions::numberInEnvironment;

constexpr std::size_t mostPairs = 400;  // which a second opinion visits
constexpr std::uint64_t standardScripts = 60;

struct Totals {
  std::size_t lifted = 0;
  std::size_t steps = 0;
  std::map<std::string, std::size_t> refused;  // by reason
};

/// Returns the reason of a refusal, without the place.
std::string reasonOf(const std::string& message) {
  const auto colon = message.rfind(": ");
  return colon == std::string::npos ? message : message.substr(colon + 2);
}

/// Returns what differs; empty if nothing does or the script is refused.
std::string disagreement(std::uint64_t seed, Totals& totals) {
  const naive::Generated generated = naive::generate(seed);
  const LiftedScript script(generated.script, generated.host);
  if (const auto& refusal = script.refusal()) {
    ++totals.refused[reasonOf(*refusal)];
    if (std::getenv("QZ_REFUSALS")) std::cout << seed << ": " << *refusal << '\n';
    return "";
  }
  ++totals.lifted;
  totals.steps += script.lifted().steps;
  return script.difference(mostPairs);
}

TEST(Lift, OfExamplesIsNoDifferentForUsers) {
  const auto files = naive::exampleScripts(QZ_SOURCE_DIR);
  for (const auto& file : files) {
    const naive::StagedScript staged = naive::stagedScript(file);
    const LiftedScript script(staged.script, staged.host, staged.resources);
    ASSERT_FALSE(script.refusal()) << file << ": " << *script.refusal();
    EXPECT_EQ(script.difference(mostPairs), "") << file;
  }
  EXPECT_GE(files.size(), 7U);
}

TEST(Lift, OfGeneratedScriptsIsNoDifferentForUsers) {
  const std::uint64_t first = numberInEnvironment("QZ_FIRST_SEED").value_or(1);
  const std::uint64_t count = numberInEnvironment("QZ_SCRIPTS").value_or(standardScripts);
  Totals totals;
  for (std::uint64_t seed = first; seed < first + count; ++seed) {
    const std::string wrong = disagreement(seed, totals);
    EXPECT_EQ(wrong, "") << "seed " << seed;
  }
  std::cout << totals.lifted << " of " << count << " scripts, " << totals.steps << " steps\n";
  for (const auto& [reason, refusals] : totals.refused) {
    std::cout << "refused: " << refusals << ": " << reason << '\n';
  }
}

}  // namespace
}  // namespace qz::tools::lift
