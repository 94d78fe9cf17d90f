// SPDX-License-Identifier: MIT
#include "tools/check/place_conclusions.hpp"

#include <algorithm>
#include <compare>
#include <map>
#include <set>

#include "tools/check/place_graph.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::check {
namespace {

class PlaceConclusions {
 public:
  PlaceConclusions(Exploration& exploration, unsigned threads)
      : exploration_(exploration), threads_(threads), script_(exploration.setting().script) {}

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
  /// Who is to blame for a move: the list that it ran, else the button that was pressed.
  struct Blame {
    std::optional<std::uint32_t> list;
    std::optional<Tag> tag;
    friend auto operator<=>(const Blame&, const Blame&) = default;
  };

  // One finding for each list, or button without a list, that leads into a dead end; its other
  // places differ only in what presses without a list have cancelled.
  void deadEnds() {
    std::vector<bool> isDead(exploration_.places());
    bool isAny = false;
    for (const PlaceCircle& circle : circles_) {
      if (circle.reachesList || circle.isEnd) continue;
      isAny = true;
      for (const std::uint32_t place : circle.places) isDead[place] = true;
    }
    if (!isAny) return;
    std::map<Blame, std::pair<Occasion, std::set<std::uint32_t>>> entries;
    exploration_.makeAllMoves(threads_, [&](const Occasion& occasion, const Arrival& arrival,
                                            std::uint32_t, std::uint32_t place) {
      const bool isFromDead =
          occasion.visit != noVisit && isDead[exploration_.visits()[occasion.visit].place];
      if (!isDead[place] || isFromDead) return;
      auto& entry = entries
                        .try_emplace(blameOf(occasion, arrival.firstList), occasion,
                                     std::set<std::uint32_t>())
                        .first->second;
      entry.second.insert(place);
    });
    for (const auto& [blame, entry] : entries) {
      add(findingOf("dead-end",
                    causeOf(blame) + " leaves the user stuck: no press and no timer " +
                        (names().isEmpty() ? "runs a list any more" : "leads on any more") +
                        ", but the walk-through has not ended",
                    "show or enable a button that has a list, start a timer, or end with "
                    "TERMINATE_PARSER"),
          blame, exploration_.path(entry.first), entry.second.size());
    }
  }

  const walkthrough::Names& names() const { return exploration_.setting().plan.names; }

  std::string nameOfList(const std::string& key) const {
    const std::string step = names().stepOf(key);
    return step.empty() ? "list " + quote(key) : "the step " + quote(step);
  }

  std::string causeOf(const Blame& blame) const {
    if (blame.list) return nameOfList(script_.lists()[*blame.list].key);
    if (blame.tag) return "a press of " + names().controlWords(*blame.tag) + ", which has no list,";
    return "the start";
  }

  Blame blameOf(const Occasion& occasion, std::optional<std::uint32_t> list) const {
    if (list || occasion.visit == noVisit || occasion.move == waitMove) return {list, {}};
    const auto* const place = exploration_.place(exploration_.visits()[occasion.visit].place);
    return {{}, exploration_.format().control(place, occasion.move).tag};
  }

  /// The same for the last move of a path.
  Blame blameOf(const Visit& visit) const {
    const auto list = listRunBy(visit);
    return blameOf(Occasion{visit.parent, visit.move},
                   list ? std::optional(static_cast<std::uint32_t>(*list)) : std::nullopt);
  }

  /// Returns the list that the last move of a path runs first; absent if it runs none.
  std::optional<std::size_t> listRunBy(const Visit& visit) const {
    if (visit.parent == noVisit) return script_.listUnder(exploration_.startKeys()[visit.move]);
    if (visit.move == waitMove) {
      const auto place = exploration_.visits()[visit.parent].place;
      return script_.listUnder(exploration_.timers(place).front().key);
    }
    return script_.listOfTag(*blameOf(Occasion{visit.parent, visit.move}, std::nullopt).tag);
  }

  // Circles that one cause leads into are one finding, with the shortest path.
  void traps() {
    std::map<Blame, std::pair<std::uint32_t, std::size_t>> entries;  // first visit, places
    for (const PlaceCircle& circle : circles_) {
      if (!circle.isLast || circle.isEnd || !circle.reachesList) continue;
      const std::uint32_t visit = firstVisitOf(circle);
      auto& entry =
          entries.try_emplace(blameOf(exploration_.visits()[visit]), visit, 0).first->second;
      entry.first = std::min(entry.first, visit);
      entry.second += circle.places.size();
    }
    for (const auto& [blame, entry] : entries) {
      add(findingOf(
              "trap",
              "after " + causeOf(blame) +
                  " the end of the walk-through cannot be reached any more, whatever the user does",
              "lead a button or a timer back to a list from which the end can be reached"),
          blame, exploration_.path(entry.first), entry.second);
    }
  }

  void noEnd() {
    findings_.push_back(findingOf("no-end",
                                  "nothing that the user does, and no timer, ends the walk-through",
                                  "run TERMINATE_PARSER in the list of a button or a timer"));
  }

  std::uint32_t firstVisitOf(const PlaceCircle& circle) const {
    std::uint32_t first = noVisit;
    for (const std::uint32_t place : circle.places) {
      first = std::min(first, exploration_.firstVisit(place));
    }
    return first;
  }

  void add(Finding finding, const Blame& blame, Path path, std::size_t places) {
    if (blame.list) {
      finding.list = script_.lists()[*blame.list].key;
      finding.where = script_.lists()[*blame.list].keyValue;
    }
    finding.tag = blame.tag;
    finding.path = std::move(path);
    finding.places = places;
    findings_.push_back(std::move(finding));
  }

  Exploration& exploration_;
  unsigned threads_;
  const Script& script_;
  std::vector<PlaceCircle> circles_;
  std::vector<Finding> findings_;
};

}  // namespace

std::vector<Finding> concludeFromPlaces(Exploration& exploration, unsigned threads) {
  if (!exploration.isComplete()) return {};
  return PlaceConclusions(exploration, threads).findings();
}

}  // namespace qz::tools::check
