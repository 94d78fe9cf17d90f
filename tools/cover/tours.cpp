// SPDX-License-Identifier: MIT
// A walk goes on to the nearest way with a goal that no walk has reached, as long as this takes no
// more moves than a new walk to there.
#include "tools/cover/tours.hpp"

#include <algorithm>
#include <queue>
#include <unordered_map>

namespace qz::tools::cover {
namespace {

using Ways = std::vector<const Way*>;

class Planner {
 public:
  Planner(const check::Exploration& exploration, const VisitGraph& graph, std::size_t longest)
      : exploration_(exploration), graph_(graph), longest_(longest), missing_(graph.goals()) {}

  std::vector<check::Path> tours() {
    std::vector<check::Path> tours;
    while (const Way* first = nextStart()) {
      tours.push_back(pathOf(walkFrom(*first)));
    }
    return tours;
  }

 private:
  /// Returns the start from which the nearest missing goal is reached; null if none is missing.
  const Way* nextStart() const {
    const Way* best = nullptr;
    std::size_t fewest = 0;
    for (const Way& start : graph_.starts()) {
      const auto more = hasMissing(start) ? std::optional(Ways()) : waysToMissing(start.to);
      if (more && (!best || more->size() < fewest)) {
        best = &start;
        fewest = more->size();
      }
    }
    return best;
  }

  Ways walkFrom(const Way& start) {
    Ways walk;
    take(start, walk);
    while (const auto more = waysToMissing(walk.back()->to)) {
      const std::uint32_t goal = more->back()->occasion.visit;
      const bool isFirst = walk.size() == 1;
      const bool isWorthIt =
          walk.size() + more->size() <= longest_ && more->size() <= exploration_.depth(goal) + 1;
      if (!isFirst && !isWorthIt) break;
      for (const Way* way : *more) take(*way, walk);
    }
    return walk;
  }

  void take(const Way& way, Ways& walk) {
    walk.push_back(&way);
    for (const Goal& goal : way.goals) missing_.erase(goal);
  }

  bool hasMissing(const Way& way) const {
    return std::any_of(way.goals.begin(), way.goals.end(),
                       [&](const Goal& goal) { return missing_.contains(goal); });
  }

  /// Returns the fewest ways from a visit to, and with, one that has a missing goal.
  std::optional<Ways> waysToMissing(std::uint32_t from) const {
    std::unordered_map<std::uint32_t, const Way*> cameBy = {{from, nullptr}};
    std::queue<std::uint32_t> next({from});
    for (; !next.empty(); next.pop()) {
      for (const Way& way : graph_.waysFrom(next.front())) {
        if (hasMissing(way)) return waysUpTo(way, cameBy);
        if (cameBy.try_emplace(way.to, &way).second) next.push(way.to);
      }
    }
    return std::nullopt;
  }

  static Ways waysUpTo(const Way& last,
                       const std::unordered_map<std::uint32_t, const Way*>& cameBy) {
    Ways ways;
    for (const Way* way = &last; way; way = cameBy.at(way->occasion.visit)) ways.push_back(way);
    std::reverse(ways.begin(), ways.end());
    return ways;
  }

  check::Path pathOf(const Ways& walk) const {
    check::Path path;
    for (const Way* way : walk) path.push_back(exploration_.path(way->occasion).back());
    return path;
  }

  const check::Exploration& exploration_;
  const VisitGraph& graph_;
  std::size_t longest_;
  std::set<Goal> missing_;
};

}  // namespace

std::vector<check::Path> toursOf(const check::Exploration& exploration, const VisitGraph& graph,
                                 std::size_t longest) {
  return Planner(exploration, graph, longest).tours();
}

}  // namespace qz::tools::cover
