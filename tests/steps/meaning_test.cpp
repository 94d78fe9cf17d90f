// SPDX-License-Identifier: MIT
// A built source does what the source means: at every place, on generated sources.
// Environment variables choose other sources, and more of them: QZ_FIRST_SEED and QZ_SOURCES.
// With QZ_AS_GENERATED a source that goes wrong is not made smaller.

#include <gtest/gtest.h>

#include <cstdlib>
#include <iostream>

#include "tests/check/checking.hpp"
#include "tests/steps/asked_findings.hpp"
#include "tests/steps/generated_folder.hpp"
#include "tests/steps/joint_walk.hpp"
#include "tests/steps/smaller_tours.hpp"
#include "tests/steps/source_generator.hpp"

namespace qz::meaning {
namespace {

using tools::steps::ScriptFile;

constexpr std::size_t mostDisagreements = 10;

std::uint64_t numberInEnvironment(const char* name, std::uint64_t otherwise) {
  const char* const text = std::getenv(name);
  return text ? std::strtoull(text, nullptr, 10) : otherwise;
}

struct Totals {
  std::size_t places = 0;
  std::size_t moves = 0;
};

/// Builds generated sources, and compares their scripts with what they mean.
class Comparison {
 public:
  Totals totals{};

  /// Returns what is wrong with the source of the seed, once it is small; empty if nothing is.
  std::string ofSeed(std::uint64_t seed) {
    const Generated generated = generate(seed);
    const std::size_t start = seed % 4;  // so that some sources start only with their first step
    std::string wrong = disagreement(generated, start);
    if (wrong.empty()) return "";
    const bool isKept = std::getenv("QZ_AS_GENERATED") != nullptr;
    const Generated small = isKept ? generated : smallest(generated, start, wrong);
    return wrong + "\n" + small.yaml + small.window;
  }

 private:
  /// The walk also starts at another step, of this number.
  std::string disagreement(const Generated& generated, std::size_t start) {
    const GeneratedFolder folder(generated);
    const auto& steps = generated.tour.steps;
    const std::string& first = steps.front().first;
    const std::string& other = steps[start % steps.size()].first;
    try {
      const ScriptFile opened = tools::steps::openScript(folder.source());
      std::string wrong = walk(generated, opened, folder, first);
      if (wrong.empty()) wrong = misjudged(opened, folder, askedFor(generated));
      if (!wrong.empty() || other == first) return wrong;
      return walk(generated, tools::steps::openScript(folder.source(), {other}), folder, other);
    } catch (const tools::Failure& failure) {
      return std::string("refused: ") + failure.what();
    }
  }

  /// A script that was built to start at a step starts with the first of its start keys.
  std::string walk(const Generated& generated, const ScriptFile& opened,
                   const GeneratedFolder& folder, const std::string& step) {
    const auto& [source, built] = *opened.from;
    const PlayableSource playable{folder.path(), built.script, built.startKeys.front(),
                                  planStage(source.stage, built.script, source.path)};
    JointWalk walk(generated.tour, playable, step);
    std::string wrong = walk.run();
    totals.places += walk.places();
    totals.moves += walk.moves();
    return wrong;
  }

  /// What the check should not say, or should have said.
  static std::string misjudged(const ScriptFile& opened, const GeneratedFolder& folder,
                               const Asked& asked) {
    tools::check::CheckOptions options;
    options.toolkit = tools::testToolkit();
    options.stage = opened.from->source.stage;
    options.resources = folder.path();
    const tools::check::Verdict verdict = checkScript(opened.file, options, {});
    if (!verdict.explored.complete) return "the check is not complete";
    bool isSaid = asked.must.empty();
    for (const tools::check::Finding& finding : verdict.findings) {
      isSaid |= asked.must.contains(finding.code);
      const bool isNote = finding.severity == tools::check::Severity::note;
      if (!isNote && !asked.may.contains(finding.code)) {
        return finding.message + " [" + finding.code + "]";
      }
    }
    return isSaid ? "" : "the check does not say [" + *asked.must.begin() + "]";
  }

  /// Returns a source that goes wrong, and no longer if it says less.
  Generated smallest(Generated generated, std::size_t start, std::string& wrong) {
    naive::Dice dice(1);
    const auto isSmaller = [&](const Tour& tour) {
      const auto source = sourceOf(tour, dice);
      const std::string why = source ? disagreement(*source, start) : "";
      const bool isRefused = why.starts_with("refused");
      if (why.empty() || isRefused != wrong.starts_with("refused")) return false;
      generated = *source;
      wrong = why;
      return true;
    };
    for (bool goesOn = true; goesOn;) {
      const auto smaller = smallerThan(generated.tour);
      goesOn = std::any_of(smaller.begin(), smaller.end(), isSmaller);
    }
    return generated;
  }
};

TEST(Meaning, OfGeneratedSourcesIsWhatTheirScriptsDo) {
  const std::uint64_t first = numberInEnvironment("QZ_FIRST_SEED", 1);
  const std::uint64_t count = numberInEnvironment("QZ_SOURCES", 200);
  Comparison comparison;
  std::size_t disagreements = 0;
  for (std::uint64_t seed = first; seed < first + count; ++seed) {
    const std::string wrong = comparison.ofSeed(seed);
    if (wrong.empty()) continue;
    ADD_FAILURE() << "seed " << seed << ": " << wrong;
    if (++disagreements == mostDisagreements) break;
  }
  const auto& [places, moves] = comparison.totals;
  std::cout << count << " sources, " << places << " places, " << moves << " moves\n";
}

}  // namespace
}  // namespace qz::meaning
