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
constexpr std::size_t sampleStep = 60;  // one mutant in so many, because the second opinion is slow
constexpr std::size_t fewestMutants = 2;  // of a script
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

/// The mutants of one script.
class Judgement {
 public:
  explicit Judgement(const naive::StagedScript& original)
      : original_(original), before_(original, placesOfAMutant), tally_(tallyOf(before_.all)) {
    EXPECT_TRUE(before_.agree()) << before_.words();
  }

  void judge(const naive::Mutant& mutant) {
    naive::StagedScript staged = original_;
    staged.script = mutant.script;
    const BothOpinions now(staged, placesOfAMutant);
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
  const auto more = naive::exampleScripts(source);
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
  const std::size_t step = all ? 1 : std::min(sampleStep, mutants.size() / fewestMutants + 1);
  Judgement judgement(staged);
  for (std::size_t i = step / 2; i < mutants.size() && !HasFailure(); i += step) {
    judgement.judge(mutants[i]);
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
