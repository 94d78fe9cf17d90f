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

/// Gives numbers to what places with their looks show.
class Appearances {
 public:
  explicit Appearances(const check::Exploration& exploration) : exploration_(exploration) {}

  std::uint32_t numberOf(std::uint32_t place, std::uint32_t look) {
    const auto next = static_cast<std::uint32_t>(numbers_.size());
    return numbers_.try_emplace(seen(place, look), next).first->second;
  }

 private:
  /// Of a control, whether it is enabled and how it looks; of a hidden one, nothing.
  using Seen = std::vector<std::pair<bool, check::LookValue>>;

  Seen seen(std::uint32_t place, std::uint32_t look) const {
    const auto& format = exploration_.format();
    const auto& parts = exploration_.looks().parts(look);
    Seen seen;
    for (std::size_t i = 0; i < parts.size(); ++i) {
      const bool isControl = i < format.controls();
      const auto state =
          isControl ? format.control(exploration_.place(place), i) : check::ControlState{};
      const auto shown = isControl ? withoutUsersState(parts[i]) : parts[i];
      seen.emplace_back(state.enabled, state.hidden ? 0 : shown);
    }
    return seen;
  }

  check::LookValue withoutUsersState(check::LookValue value) const {
    check::ViewLook look = exploration_.looks().look(value);
    if (!look.hasUsersState) return value;
    look.view.state = toolkit::State::off;
    return exploration_.looks().valueOf(look);
  }

  const check::Exploration& exploration_;
  std::map<Seen, std::uint32_t> numbers_;
};

}  // namespace

VisitGraph::VisitGraph(check::Exploration& exploration, unsigned threads) {
  const auto& visits = exploration.visits();
  const VisitNumbers numbers = numbersOf(visits);
  Appearances appearances(exploration);
  const auto stepAt = [&](const Visit& visit) {
    return SeenStep{visit.lastList, appearances.numberOf(visit.place, visit.look)};
  };
  ways_.resize(visits.size());
  exploration.makeAllMoves(
      threads, [&](const check::Occasion& occasion, const check::Arrival& arrival,
                   std::uint32_t lastList, std::uint32_t place) {
        const auto to = numbers.find({place, arrival.look});
        if (to == numbers.end()) return;  // beyond a limit
        const bool isStart = occasion.visit == check::noVisit;
        Way way{.occasion = occasion, .to = to->second};
        way.goals.push_back({.from = isStart ? SeenStep{} : stepAt(visits[occasion.visit]),
                             .place = isStart ? check::noPlace : visits[occasion.visit].place,
                             .move = arrival.move,
                             .to = {lastList, appearances.numberOf(place, arrival.look)}});
        for (const std::uint32_t list : arrival.watchedLists)
          way.goals.push_back({.ranList = list});
        (isStart ? starts_ : ways_[occasion.visit]).push_back(std::move(way));
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
