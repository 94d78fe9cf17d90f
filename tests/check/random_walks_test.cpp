// SPDX-License-Identifier: MIT
// A user who makes any move never reaches a place that the check has not listed. The environment
// variable QZ_MOVES sets how many moves are made, and then prints what was done.

#include <gtest/gtest.h>

#include <iostream>

#include "tests/check/both_opinions.hpp"
#include "tests/check/generated_scripts.hpp"
#include "tests/check/random_walk.hpp"

namespace qz::tools::check::opinions {
namespace {

constexpr std::uint64_t fewMoves = 2000;
constexpr std::size_t placesOfAWalk = 20'000;  // scripts with more are left out

/// Walks through scripts, and counts.
class Walks {
 public:
  /// Makes so many random moves. Returns NO if the script has too many places.
  bool walk(const naive::StagedScript& staged, std::uint64_t seed, std::uint64_t moves) {
    const CheckedScript checked(staged, placesOfAWalk);
    if (!checked.exploration().isComplete()) return false;
    const auto listed = checked.places();
    naive::RandomWalk user(staged.script, staged.host, checked.startKey(), seed, staged.resources);
    std::set<std::string> reached;
    for (std::uint64_t i = 0; i < moves; ++i) {
      const std::string place = user.next();
      if (place.empty()) continue;  // lists ran each other without end
      if (!reached.insert(place).second || listed.contains(place)) continue;
      ADD_FAILURE() << "move " << i << " of seed " << seed
                    << " reaches a place that is not listed\n"
                    << place << "\n"
                    << staged.script->description();
      break;
    }
    ++scripts_;
    moves_ += moves;
    listed_ += listed.size();
    reached_ += reached.size();
    return true;
  }

  void print(const char* where) const {
    if (!numberInEnvironment("QZ_MOVES")) return;
    std::cout << moves_ << " random moves in " << scripts_ << " " << where << ", through "
              << reached_ << " of " << listed_ << " places\n";
  }

 private:
  std::size_t scripts_ = 0;
  std::uint64_t moves_ = 0;
  std::size_t listed_ = 0;
  std::size_t reached_ = 0;
};

TEST(RandomWalks, ReachOnlyListedPlacesInTheExamples) {
  const std::uint64_t moves = numberInEnvironment("QZ_MOVES").value_or(fewMoves);
  const auto files = naive::exampleScripts(QZ_SOURCE_DIR);
  Walks walks;
  for (const auto& file : files) {
    EXPECT_TRUE(walks.walk(naive::stagedScript(file), 1, moves / files.size())) << file;
  }
  walks.print("examples");
}

TEST(RandomWalks, ReachOnlyListedPlacesInGeneratedScripts) {
  const auto wanted = numberInEnvironment("QZ_MOVES");
  const std::uint64_t moves = wanted.value_or(fewMoves);
  const std::uint64_t scripts = wanted ? 100 : 20;
  Walks walks;
  std::uint64_t walked = 0;
  for (std::uint64_t seed = 1; walked < scripts; ++seed) {
    naive::Generated generated = naive::generate(seed);
    if (startKeyOf(Script(generated.script)).empty()) continue;
    if (walks.walk({generated.script, generated.host, "/"}, seed, moves / scripts)) ++walked;
  }
  walks.print("generated scripts");
}

}  // namespace
}  // namespace qz::tools::check::opinions
