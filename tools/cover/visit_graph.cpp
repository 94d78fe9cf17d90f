// SPDX-License-Identifier: MIT
#include "tools/cover/visit_graph.hpp"

#include <map>

namespace qz::tools::cover {
namespace {

using check::Visit;

/// The first visit of each place with each look.
using VisitNumbers = std::map<std::pair<std::uint32_t, std::uint32_t>, std::uint32_t>;

VisitNumbers numbersOf(const std::vector<Visit>& visits) {
  VisitNumbers numbers;
  for (std::uint32_t i = 0; i < visits.size(); ++i) {
    numbers.try_emplace({visits[i].place, visits[i].look}, i);
  }
  return numbers;
}

std::vector<Goal> goalsOf(const SeenStep& from, const check::Arrival& arrival,
                          std::uint32_t lastList) {
  std::vector<Goal> goals = {{.from = from, .move = arrival.move, .to = {lastList, arrival.look}}};
  for (const std::uint32_t list : arrival.watchedLists) goals.push_back({.ranList = list});
  return goals;
}

}  // namespace

VisitGraph::VisitGraph(check::Exploration& exploration, unsigned threads) {
  const auto& visits = exploration.visits();
  const VisitNumbers numbers = numbersOf(visits);
  ways_.resize(visits.size());
  exploration.makeAllMoves(
      threads, [&](const check::Occasion& occasion, const check::Arrival& arrival,
                   std::uint32_t lastList, std::uint32_t place) {
        const auto to = numbers.find({place, arrival.look});
        if (to == numbers.end()) return;  // beyond a limit
        const bool isStart = occasion.visit == check::noVisit;
        const SeenStep from =
            isStart ? SeenStep{}
                    : SeenStep{visits[occasion.visit].lastList, visits[occasion.visit].look};
        auto& ways = isStart ? starts_ : ways_[occasion.visit];
        ways.push_back({occasion, to->second, goalsOf(from, arrival, lastList)});
      });
}

std::set<Goal> VisitGraph::goals() const {
  std::set<Goal> goals;
  const auto addAll = [&](const std::vector<Way>& ways) {
    for (const Way& way : ways) goals.insert(way.goals.begin(), way.goals.end());
  };
  addAll(starts_);
  for (const auto& ways : ways_) addAll(ways);
  return goals;
}

}  // namespace qz::tools::cover
