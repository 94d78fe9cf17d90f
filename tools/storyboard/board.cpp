// SPDX-License-Identifier: MIT
#include "tools/storyboard/board.hpp"

#include <algorithm>
#include <map>
#include <tuple>

namespace qz::tools::storyboard {
namespace {

using check::Visit;

/// Finds the steps of visits.
class StepFinder {
 public:
  explicit StepFinder(const check::Exploration& exploration) : exploration_(exploration) {}

  std::vector<BoardStep> steps() {
    std::vector<BoardStep> steps;
    const auto& visits = exploration_.visits();
    for (std::uint32_t i = 0; i < visits.size(); ++i) {
      const auto next = static_cast<StepIndex>(steps.size());
      if (!numbers_.try_emplace(keyOf(visits[i]), next).second) continue;
      steps.push_back(stepAt(visits[i], i));
      steps.back().group = groupOf(visits[i], steps);
    }
    return steps;
  }

  std::optional<StepIndex> find(std::uint32_t place, std::uint32_t look, std::uint32_t list) const {
    const auto found = numbers_.find(keyOf({.place = place, .look = look, .lastList = list}));
    return found == numbers_.end() ? std::nullopt : std::optional(found->second);
  }

 private:
  /// Whether the walk-through is over; the place; the look. After the end the list, which is
  /// nobody's business in a source, and 0.
  using Key = std::tuple<bool, std::uint32_t, std::uint32_t>;

  Key keyOf(const Visit& visit) const {
    if (isOver(visit.place)) return {true, hasNames() ? 0 : visit.lastList, 0};
    return {false, visit.place, visit.look};
  }

  bool hasNames() const { return !exploration_.setting().plan.names.isEmpty(); }

  bool isOver(std::uint32_t place) const {
    return exploration_.format().isOver(exploration_.place(place));
  }

  BoardStep stepAt(const Visit& visit, std::uint32_t index) const {
    BoardStep step{.visit = index,
                   .place = visit.place,
                   .look = visit.look,
                   .list = visit.lastList,
                   .isOver = isOver(visit.place)};
    if (step.isOver) return step;
    const std::uint8_t* const place = exploration_.place(visit.place);
    for (std::size_t i = 0; i < exploration_.format().controls(); ++i) {
      const auto state = exploration_.format().control(place, i);
      if (!drivers::isButton(exploration_.setting().kinds[i]) || state.hidden) continue;
      if (state.enabled) step.moves.push_back({static_cast<check::Move>(i)});
    }
    const auto& timers = exploration_.timers(visit.place);
    const bool fires = !timers.empty() && timers.front().seconds != check::neverFires;
    if (fires) step.moves.push_back({check::waitMove});
    return step;
  }

  /// Returns the key of the list that had the last word; of the start while nothing had a command.
  const std::string& lastKey(const Visit& visit) const {
    if (visit.lastList != check::noList) {
      return exploration_.setting().script.lists()[visit.lastList].key;
    }
    const Visit* start = &visit;
    while (start->parent != check::noVisit) start = &exploration_.visits()[start->parent];
    return exploration_.startKeys()[start->move];
  }

  /// A list that leads to no step of the source leaves the walk-through where it was.
  std::string groupOf(const Visit& visit, const std::vector<BoardStep>& known) const {
    const std::string& key = lastKey(visit);
    const auto& names = exploration_.setting().plan.names;
    if (names.isEmpty()) return key;
    if (isOver(visit.place)) return "the end";
    std::string name = names.stepOf(key);
    if (!name.empty() || visit.parent == check::noVisit) return name;
    const Visit& parent = exploration_.visits()[visit.parent];
    return known[*find(parent.place, parent.look, parent.lastList)].group;
  }

  const check::Exploration& exploration_;
  std::map<Key, StepIndex> numbers_;
};

}  // namespace

Board::Board(check::Exploration& exploration, unsigned threads) : exploration_(exploration) {
  StepFinder finder(exploration);
  steps_ = finder.steps();
  starts_.resize(exploration.startKeys().size());
  exploration.makeAllMoves(
      threads, [&](const check::Occasion& occasion, const check::Arrival& arrival,
                   std::uint32_t list, std::uint32_t place) {
        const auto to = finder.find(place, arrival.look, list);
        if (!to) return;  // beyond a limit
        const Visit& first = exploration.visits()[steps_[*to].visit];
        if (first.parent == occasion.visit && first.move == occasion.move) {
          steps_[*to].ranLists = arrival.watchedLists;
        }
        if (occasion.visit == check::noVisit) {
          starts_[occasion.move] = to;
          return;
        }
        const Visit& from = exploration.visits()[occasion.visit];
        auto& moves = steps_[*finder.find(from.place, from.look, from.lastList)].moves;
        const auto known = std::find_if(moves.begin(), moves.end(), [&](const BoardMove& each) {
          return each.move == occasion.move;
        });
        if (known != moves.end()) known->to = to;
      });
}

std::optional<StepIndex> Board::after(StepIndex step, const check::Step& move) const {
  const auto* const press = std::get_if<check::PressMove>(&move);
  const check::Move wanted = press ? static_cast<check::Move>(press->control) : check::waitMove;
  const auto& moves = steps_[step].moves;
  const auto found = std::find_if(moves.begin(), moves.end(),
                                  [&](const BoardMove& each) { return each.move == wanted; });
  return found == moves.end() ? std::nullopt : found->to;
}

std::vector<StepIndex> Board::stepsOf(const check::Path& path) const {
  std::vector<StepIndex> steps;
  for (const check::Step& move : path) {
    std::optional<StepIndex> next;
    if (const auto* const start = std::get_if<check::StartMove>(&move)) {
      const auto& keys = exploration_.startKeys();
      const auto key = std::find(keys.begin(), keys.end(), start->key);
      if (key != keys.end()) next = starts_[static_cast<std::size_t>(key - keys.begin())];
    } else if (!steps.empty()) {
      next = after(steps.back(), move);
    }
    if (!next) break;
    steps.push_back(*next);
  }
  return steps;
}

std::optional<StepIndex> Board::endOf(const check::Path& path) const {
  const auto steps = stepsOf(path);
  return steps.size() == path.size() ? std::optional(steps.back()) : std::nullopt;
}

}  // namespace qz::tools::storyboard
