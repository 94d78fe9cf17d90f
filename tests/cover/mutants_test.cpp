// SPDX-License-Identifier: MIT
// The scenarios that cover generated scripts pass, and notice each mistake in them that a second
// opinion sees. Environment variables choose other scripts, and more of them: QZ_FIRST_SEED and
// QZ_SCRIPTS; and with QZ_MUTANTS so many mistakes are looked at.
#include "tests/check/mutants.hpp"

#include <gtest/gtest.h>

#include <cstdlib>
#include <iostream>
#include <memory>

#include "qz/property_list/xml_writer.hpp"
#include "tests/check/both_opinions.hpp"
#include "tests/check/generated_scripts.hpp"
#include "tests/check/joint_play.hpp"
#include "tests/check/orderly_scripts.hpp"
#include "tests/cover/passing.hpp"
#include "tests/tools/play_files.hpp"
#include "tools/cover/cover.hpp"

namespace qz::tools::cover {
namespace {

using check::opinions::numberInEnvironment;
using check::opinions::startKeyOf;

constexpr std::size_t mostPairs = 400;  // which the second opinion visits
constexpr std::uint64_t standardScripts = 20;
constexpr std::uint64_t standardMistakes = 30;
constexpr std::size_t mistakesOfAScript = 3;

/// A directory with a generated script and the scenarios that cover it.
class CoveredScript {
 public:
  explicit CoveredScript(const naive::Generated& generated) : generated_(generated) {
    use(generated.script);
    check::CheckOptions options;
    options.stage.window = "host.plist";
    options.stage.host = std::make_shared<const walkthrough::HostWindow>(generated.host);
    const Coverage coverage = coverScript(InputFile("script.plist", "a script"), options, ".", {});
    for (const auto& [name, text] : coverage.files) directory_.write(name, text);
    scenarios_ = coverage.files.size();
  }

  /// Puts another script into its place.
  void use(const naive::Script& script) const {
    directory_.write("script.plist", toolkit::writeXmlPropertyList(script));
  }

  /// Returns what a second opinion sees differ in a mutant; empty if nothing, or if it gave up.
  std::string difference(const naive::Script& mutant) const {
    naive::JointPlay play({generated_.script, startKeyOf(check::Script(generated_.script))},
                          {mutant, startKeyOf(check::Script(generated_.script))}, generated_.host);
    const auto found = play.run(mostPairs);
    return found ? found->words : "";
  }

  std::size_t scenarios() const { return scenarios_; }

 private:
  const naive::Generated& generated_;
  play::WorkingDirectory directory_;
  std::size_t scenarios_ = 0;
};

TEST(CoverOfGenerated, Passes) {
  const std::uint64_t first = numberInEnvironment("QZ_FIRST_SEED").value_or(1);
  const auto asked = numberInEnvironment("QZ_SCRIPTS");
  std::size_t scenarios = 0;
  ::setenv("QT_QPA_PLATFORM", "offscreen", 0);
  for (std::uint64_t seed = first; seed < first + asked.value_or(standardScripts); ++seed) {
    const naive::Generated generated = naive::generate(seed);
    const CoveredScript covered(generated);
    scenarios += covered.scenarios();
    EXPECT_EQ(firstFailureOn("memory"), "") << "seed " << seed;
    if (!asked || !makeDriver("qt")) continue;  // real windows take long
    EXPECT_EQ(firstFailureOn("qt"), "") << "seed " << seed;
  }
  std::cout << scenarios << " scenarios\n";
  EXPECT_GE(scenarios, asked.value_or(standardScripts) / 2);
}

TEST(CoverOfGenerated, NoticesMistakes) {
  std::uint64_t seed = numberInEnvironment("QZ_FIRST_SEED").value_or(1);
  const std::uint64_t count = numberInEnvironment("QZ_MUTANTS").value_or(standardMistakes);
  std::size_t noticed = 0;
  std::size_t missed = 0;
  for (; noticed + missed < count; ++seed) {
    const naive::Generated generated = naive::generate(seed);
    if (!naive::hasListsOnly(generated.script)) continue;
    const CoveredScript covered(generated);
    const auto mutants = naive::mutantsOf(generated.script, seed);
    const std::size_t step = std::max<std::size_t>(1, mutants.size() / mistakesOfAScript);
    for (std::size_t i = 0; i < mutants.size() && noticed + missed < count; i += step) {
      const std::string difference = covered.difference(mutants[i].script);
      if (difference.empty()) continue;
      covered.use(mutants[i].script);
      const bool isNoticed = !firstFailureOn("memory").empty();
      EXPECT_TRUE(isNoticed) << "seed " << seed << ": " << mutants[i].words << "\n" << difference;
      ++(isNoticed ? noticed : missed);
    }
  }
  std::cout << noticed << " of " << noticed + missed << " mistakes noticed\n";
}

}  // namespace
}  // namespace qz::tools::cover
