// SPDX-License-Identifier: MIT
// Says which expectations hold, from every move that was explored.
#pragma once

#include <cstdint>
#include <optional>
#include <vector>

#include "tools/check/expectations.hpp"
#include "tools/check/finding.hpp"
#include "tools/exploration/exploration.hpp"

namespace qz::tools::check {

/// How many expectations hold, how many do not, and how many are open because not everything was
/// explored.
struct ExpectationCounts {
  std::size_t hold = 0;
  std::size_t fail = 0;
  std::size_t open = 0;
};

class ExpectationCheck {
 public:
  ExpectationCheck(const Exploration& exploration, const std::vector<Expectation>& expectations);

  /// Takes note of where a move has led.
  void see(const Occasion& occasion, const Arrival& arrival, std::uint32_t place);

  /// Returns a finding for each expectation that does not hold.
  std::vector<Finding> findings();
  /// Valid after `findings`.
  const ExpectationCounts& counts() const { return counts_; }

 private:
  struct Evidence {
    std::optional<Occasion> first{};  // that the condition was met, or the rule broken
    std::size_t depth = 0;            // moves of its path
    std::vector<bool> leadsThere{};   // by place: a move from it, or being there, meets it
  };

  bool meets(const Condition& condition, const Arrival& arrival, std::uint32_t place) const;
  bool isSo(const Condition& condition, const Arrival& arrival, std::uint32_t place) const;
  bool isMeant(const Condition& condition, Tag tag) const;
  bool isControlSo(const Condition& condition, const Arrival& arrival, std::uint32_t place,
                   std::size_t control) const;
  void note(const Expectation& expectation, Evidence& evidence, const Occasion& occasion,
            std::uint32_t place) const;
  std::optional<Finding> judge(const Expectation& expectation, Evidence& evidence);
  std::optional<Finding> judgeAlways(const Expectation& expectation, Evidence& evidence);
  std::optional<std::uint32_t> placeWithoutWay(std::vector<bool> leadsThere) const;

  const Exploration& exploration_;
  const std::vector<Expectation>& expectations_;
  std::vector<Evidence> evidence_;
  ExpectationCounts counts_;
};

}  // namespace qz::tools::check
