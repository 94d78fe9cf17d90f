// SPDX-License-Identifier: MIT
#include "tools/check/place_conclusions.hpp"

#include <algorithm>
#include <map>
#include <set>

#include "tools/check/place_graph.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::check {
namespace {

class PlaceConclusions {
 public:
  explicit PlaceConclusions(const Exploration& exploration)
      : exploration_(exploration), script_(exploration.setting().script) {}

  std::vector<Finding> findings() {
    circles_ = circlesOf(exploration_);
    deadEnds();
    const bool canEnd = std::any_of(circles_.begin(), circles_.end(),
                                    [](const PlaceCircle& circle) { return circle.isEnd; });
    if (canEnd) {
      traps();
    } else {
      noEnd();
    }
    return std::move(findings_);
  }

 private:
  // A place is reported where the way into the dead end begins: its places differ only in what the
  // presses that run nothing have cancelled.
  void deadEnds() {
    std::set<std::uint32_t> dead;
    for (const PlaceCircle& circle : circles_) {
      if (!circle.reachesList && !circle.isEnd)
        dead.insert(circle.places.begin(), circle.places.end());
    }
    std::map<std::uint32_t, std::vector<std::uint32_t>> byList;  // first visits of entries
    for (const std::uint32_t place : dead) {
      const std::uint32_t number = exploration_.firstVisit(place);
      const Visit& visit = exploration_.visits()[number];
      if (visit.parent == noVisit || !dead.contains(exploration_.visits()[visit.parent].place))
        byList[visit.lastList].push_back(number);
    }
    for (const auto& [list, visits] : byList) {
      add(findingOf("dead-end",
                    "after this nothing that the user does, and no timer, runs a list again, but the "
                    "walk-through has not ended",
                    "show or enable a button that has a list, start a timer, or end with "
                    "TERMINATE_PARSER"),
          list, visits.front(), visits.size());
    }
  }

  void traps() {
    for (const PlaceCircle& circle : circles_) {
      if (!circle.isLast || circle.isEnd || !circle.reachesList) continue;
      const std::uint32_t visit = firstVisitOf(circle);
      add(findingOf("trap",
                    "from here the end of the walk-through cannot be reached any more, whatever the "
                    "user does",
                    "lead a button or a timer back to a list from which the end can be reached"),
          exploration_.visits()[visit].lastList, visit, circle.places.size());
    }
  }

  void noEnd() {
    findings_.push_back(findingOf("no-end",
                                  "nothing that the user can do ends the walk-through",
                                  "run TERMINATE_PARSER in some list"));
  }

  std::uint32_t firstVisitOf(const PlaceCircle& circle) const {
    std::uint32_t first = noVisit;
    for (const std::uint32_t place : circle.places)
      first = std::min(first, exploration_.firstVisit(place));
    return first;
  }

  void add(Finding finding, std::uint32_t list, std::uint32_t visit, std::size_t places) {
    if (list != noList) {
      finding.list = script_.lists()[list].key;
      finding.where = script_.lists()[list].keyValue;
    }
    finding.path = exploration_.path(visit);
    finding.places = places;
    findings_.push_back(std::move(finding));
  }

  const Exploration& exploration_;
  const Script& script_;
  std::vector<PlaceCircle> circles_;
  std::vector<Finding> findings_;
};

}  // namespace

std::vector<Finding> concludeFromPlaces(const Exploration& exploration) {
  if (!exploration.isComplete()) return {};
  return PlaceConclusions(exploration).findings();
}

}  // namespace qz::tools::check
