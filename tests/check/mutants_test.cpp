// SPDX-License-Identifier: MIT
// Mistakes in correct scripts: the check finds what the second opinion finds, and nothing else. The
// ordinary run takes a sample of the mutants; with the environment variable QZ_MUTANTS it takes all
// of them, and prints how many there were.
#include "tests/check/mutants.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <iostream>
#include <map>
#include <utility>

#include "tests/check/both_opinions.hpp"

namespace qz::tools::check::opinions {
namespace {

constexpr std::size_t placesOfAMutant = 1000;  // more take the second opinion too long
constexpr std::size_t sampleShare = 60;        // the ordinary run takes one mutant of so many
constexpr std::uint64_t mutantSeed = 1;

/// How often each code was found for each tag. Lists and elements do not count: a mistake shifts
/// them.
using Tally = std::map<std::pair<std::string, std::optional<toolkit::Tag>>, std::size_t>;

Tally tallyOf(const Findings& findings) {
  Tally tally;
  for (const naive::Finding& finding : findings) ++tally[{finding.code, finding.tag}];
  return tally;
}

/// Whether there is anything that was not there before.
bool hasMore(const Tally& now, const Tally& before) {
  return std::any_of(now.begin(), now.end(), [&](const auto& each) {
    const auto old = before.find(each.first);
    return old == before.end() || old->second < each.second;
  });
}

struct BothOpinions {
  CheckedScript checked;
  Findings explored;  // the check's findings that need exploring
  Findings all;       // and with those that are read off the script
  naive::Exploration theirs;
  Findings others;  // those of the second opinion that the check reports as well

  explicit BothOpinions(const naive::StagedScript& staged)
      : checked(staged, placesOfAMutant),
        explored(inTheSameWords(checked.exploredFindings())),
        all(inTheSameWords(checked.readFindings())),
        theirs(naive::explore(staged.script, staged.host, {checked.startKey()}, placesOfAMutant,
                              staged.resources)),
        others(comparable(theirs.findings)) {
    all.insert(all.end(), explored.begin(), explored.end());
  }

  bool agree() const {
    return selfCheck(checked.exploration()) == std::nullopt && checked.places() == theirs.places &&
           checked.exploration().presses() == theirs.presses &&
           checked.exploration().waits() == theirs.waits && explored == others;
  }
  std::string words() const {
    const auto& exploration = checked.exploration();
    return "check: " + std::to_string(exploration.places()) + " places, " +
           std::to_string(exploration.presses()) + " presses, " +
           std::to_string(exploration.waits()) + " waits; " +
           selfCheck(exploration).value_or("self-check passed") + "\n" + wordsOf(explored) +
           "second opinion: " + std::to_string(theirs.places.size()) + " places, " +
           std::to_string(theirs.presses) + " presses, " + std::to_string(theirs.waits) +
           " waits\n" + wordsOf(others);
  }
};

/// The mutants of one script.
class Judgement {
 public:
  explicit Judgement(const naive::StagedScript& original)
      : original_(original), before_(original), tally_(tallyOf(before_.all)) {
    EXPECT_TRUE(before_.agree()) << before_.words();
  }

  void judge(const naive::Mutant& mutant) {
    naive::StagedScript staged = original_;
    staged.script = mutant.script;
    const BothOpinions now(staged);
    if (!now.theirs.complete) {
      ++leftOut_;
      return;
    }
    EXPECT_TRUE(now.agree()) << mutant.words << "\n" << now.words() << mutant.script->description();
    const bool isFound = hasMore(tallyOf(now.all), tally_);
    ++(isFound ? found_ : harmless_);
    if (isFound) return;
    EXPECT_NE(mutant.mistake, naive::Mutant::Mistake::misspelt) << mutant.words;
    EXPECT_FALSE(hasMore(tallyOf(now.others), tallyOf(before_.others)))
        << mutant.words << "\n"
        << now.words() << mutant.script->description();
  }

  void print(const std::string& name) const {
    std::cout << name << ": " << found_ + harmless_ + leftOut_ << " mutants, " << found_
              << " found, " << harmless_ << " harmless, " << leftOut_ << " left out\n";
  }

 private:
  const naive::StagedScript& original_;
  BothOpinions before_;
  Tally tally_;
  std::size_t found_ = 0;
  std::size_t harmless_ = 0;  // no new finding, as the second opinion confirms
  std::size_t leftOut_ = 0;   // too many places
};

std::vector<std::filesystem::path> originals() {
  const std::string source = QZ_SOURCE_DIR;
  auto files = naive::scriptFilesIn(source + "/tests/check/corpus");
  const auto more = naive::scriptFilesIn(source + "/examples");
  files.insert(files.end(), more.begin(), more.end());
  return files;
}

/// Returns the folder and the name of a script.
std::string nameOf(const std::filesystem::path& file) {
  std::string name = file.parent_path().filename().string() + "_" + file.stem().string();
  std::replace(name.begin(), name.end(), '-', '_');
  return name;
}

class Mutants : public testing::TestWithParam<std::filesystem::path> {};

TEST_P(Mutants, AreJudgedAlikeByBoth) {
  const bool all = numberInEnvironment("QZ_MUTANTS").has_value();
  const auto staged = naive::stagedScript(GetParam());
  const auto mutants = naive::mutantsOf(staged.script, mutantSeed);
  Judgement judgement(staged);
  for (std::size_t i = 0; i < mutants.size() && !HasFailure(); ++i) {
    if (all || i % sampleShare == mutants.size() % sampleShare) judgement.judge(mutants[i]);
  }
  if (all) judgement.print(nameOf(GetParam()));
}

INSTANTIATE_TEST_SUITE_P(All, Mutants, testing::ValuesIn(originals()),
                         [](const auto& each) { return nameOf(each.param); });

TEST(MutantsOfAll, AreManyAndOfEveryMistake) {
  std::map<naive::Mutant::Mistake, std::size_t> counts;
  std::size_t count = 0;
  for (const auto& file : originals()) {
    for (const naive::Mutant& mutant :
         naive::mutantsOf(naive::stagedScript(file).script, mutantSeed)) {
      ++counts[mutant.mistake];
      ++count;
    }
  }
  EXPECT_EQ(counts.size(), 5U);
  EXPECT_GE(count, 500U);
}

TEST(MutantsOfAll, AreTheSameForTheSameSeed) {
  const auto script = naive::stagedScript(originals().front()).script;
  const auto one = naive::mutantsOf(script, mutantSeed);
  const auto other = naive::mutantsOf(script, mutantSeed);
  ASSERT_EQ(one.size(), other.size());
  for (std::size_t i = 0; i < one.size(); ++i) {
    EXPECT_EQ(one[i].script->description(), other[i].script->description());
    EXPECT_NE(one[i].script->description(), script->description()) << one[i].words;
  }
}

}  // namespace
}  // namespace qz::tools::check::opinions
