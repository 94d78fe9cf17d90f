// SPDX-License-Identifier: MIT
// Mistakes in generated scripts: diff says that users notice a difference exactly when a second
// opinion says so, names the control and the property, and gives the swapped answer to the swapped
// question. Environment variables choose other scripts, and more mutants: QZ_FIRST_SEED and
// QZ_DIFFS.
#include "tests/check/mutants.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <iostream>

#include "tests/check/both_opinions.hpp"
#include "tests/check/generated_scripts.hpp"
#include "tests/check/joint_play.hpp"
#include "tests/check/orderly_scripts.hpp"
#include "tests/diff/diffed_scripts.hpp"

namespace qz::tools::diff {
namespace {

using check::opinions::numberInEnvironment;
using check::opinions::startKeyOf;
using nlohmann::json;

constexpr std::size_t mostPairs = 400;  // which the second opinion visits
constexpr std::uint64_t standardMutants = 50;
constexpr std::size_t mutantsOfAScript = 3;

/// Swaps old and new in a report.
json swapped(const json& report) {
  if (report.is_array()) {
    json array = json::array();
    for (const json& each : report) array.push_back(swapped(each));
    return array;
  }
  if (!report.is_object()) return report;
  json object;
  for (const auto& [key, value] : report.items()) {
    const std::string other = key == "old"    ? "new"
                              : key == "new"  ? "old"
                              : key == "came" ? "went"
                              : key == "went" ? "came"
                                              : key;
    object[other] = swapped(value);
  }
  if (object.value("kind", "") == "new-step") {
    object["kind"] = "gone-step";
  } else if (object.value("kind", "") == "gone-step") {
    object["kind"] = "new-step";
  }
  return object;
}

/// Returns a report whose lists have an order that does not depend on which script is the old one.
json sorted(json report) {
  for (const char* list : {"behavior", "words"}) {
    std::sort(report[list].begin(), report[list].end());
  }
  report["old"].erase("script");
  report["new"].erase("script");
  return report;
}

/// Whether a change names a control and a property as the second opinion does.
bool names(const Change& change, const std::pair<std::size_t, std::string>& seen) {
  return std::any_of(change.controls.begin(), change.controls.end(), [&](const auto& each) {
    const std::string& property = each.property.property;
    const bool isCaption = property.ends_with("text") || property.ends_with("title");
    return each.control == seen.first && (isCaption ? "caption" : property) == seen.second;
  });
}

class Judge {
 public:
  void judge(const naive::Generated& generated, const naive::Mutant& mutant) {
    naive::JointPlay play({generated.script, startKeyOf(check::Script(generated.script))},
                          {mutant.script, startKeyOf(check::Script(mutant.script))},
                          generated.host);
    const auto theirs = play.run(mostPairs);
    if (!theirs && play.pairs() >= mostPairs) {
      ++leftOut_;
      return;
    }
    const DiffedScripts ours({generated.script, generated.host}, {mutant.script, generated.host},
                             "");
    ASSERT_TRUE(ours.diff().isComplete);
    EXPECT_EQ(!ours.changes().empty(), theirs.has_value())
        << (theirs ? theirs->words : "no difference") << ours.text();
    ++(theirs ? different_ : same_);
    if (theirs) judgeNames(*theirs, ours);
    const DiffedScripts other({mutant.script, generated.host}, {generated.script, generated.host},
                              "");
    EXPECT_EQ(sorted(swapped(ours.json())), sorted(other.json()));
  }

  std::size_t judged() const { return different_ + same_; }
  std::size_t different() const { return different_; }
  void print() const {
    std::cout << judged() << " mutants, " << different_ << " different, " << same_ << " the same, "
              << leftOut_ << " left out\n";
  }

 private:
  static void judgeNames(const naive::JointDifference& theirs, const DiffedScripts& ours) {
    const auto& changes = ours.changes();
    auto fewest = static_cast<std::size_t>(-1);
    for (const Change& change : changes) {
      if (change.path.before.size() == change.path.after.size())
        fewest = std::min(fewest, change.path.after.size());
    }
    EXPECT_EQ(fewest, theirs.moves + 1) << theirs.words << ours.text();
    for (const auto& seen : theirs.controls) {
      EXPECT_TRUE(std::any_of(changes.begin(), changes.end(),
                              [&](const Change& change) { return names(change, seen); }))
          << seen.first << ": " << seen.second << "\n"
          << theirs.words << ours.text();
    }
  }

  std::size_t different_ = 0;
  std::size_t same_ = 0;
  std::size_t leftOut_ = 0;
};

TEST(DiffOfMutants, IsWhatASecondOpinionSays) {
  std::uint64_t seed = numberInEnvironment("QZ_FIRST_SEED").value_or(1);
  const std::uint64_t count = numberInEnvironment("QZ_DIFFS").value_or(standardMutants);
  Judge judge;
  for (; judge.judged() < count && !HasFailure(); ++seed) {
    const naive::Generated generated = naive::generate(seed);
    if (!naive::hasListsOnly(generated.script)) continue;
    const auto mutants = naive::mutantsOf(generated.script, seed);
    const std::size_t step = std::max<std::size_t>(1, mutants.size() / mutantsOfAScript);
    for (std::size_t i = 0; i < mutants.size() && judge.judged() < count; i += step) {
      SCOPED_TRACE("seed " + std::to_string(seed) + ": " + mutants[i].words);
      judge.judge(generated, mutants[i]);
    }
  }
  judge.print();
  EXPECT_GE(judge.different(), count / 3);
  EXPECT_GE(judge.judged() - judge.different(), count / 50);
}

}  // namespace
}  // namespace qz::tools::diff
