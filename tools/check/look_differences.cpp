// SPDX-License-Identifier: MIT
// Finds the places that look different depending on the way to them. An exploration keeps what a
// place can show, but not after which list: so every move is made once more where it may matter.
#include <algorithm>

#include "tools/check/expansion.hpp"
#include "tools/check/exploration.hpp"

namespace qz::tools::check {
namespace {

/// What a control showed after a list, and when first.
struct Seen {
  LookValue value = 0;
  Occasion occasion;
};

/// Whether a user sees two different things. A state that the user made does not count.
bool differs(Looks& looks, LookValue a, LookValue b) {
  if (a == b) return false;
  const ViewLook& one = looks.look(a);
  const ViewLook& other = looks.look(b);
  if (!one.hasUsersState && !other.hasUsersState) return true;
  return looks.valueOf({one.view, true}) != looks.valueOf({other.view, true});
}

class Comparison {
 public:
  explicit Comparison(const Exploration& exploration) : exploration_(exploration) {}

  /// Compares what a place shows after `occasion` with what it showed before.
  void see(std::uint32_t place, std::uint32_t list, std::uint32_t look, const Occasion& occasion) {
    const auto& format = exploration_.format();
    if (format.isOver(exploration_.place(place))) return;
    const Looks::Parts& parts = exploration_.looks().parts(look);
    for (const std::size_t part : exploration_.partsWithSeveralLooks(place)) {
      if (!format.control(exploration_.place(place), part).hidden) {
        seePart(place, list, part, {parts[part], occasion});
      }
    }
  }

  std::vector<LookDifference> take() const {
    std::vector<LookDifference> found;
    for (const auto& [key, difference] : differences_) found.push_back(difference);
    return found;
  }

 private:
  void seePart(std::uint32_t place, std::uint32_t list, std::size_t part, const Seen& seen) {
    auto& all = seen_[{place, list, part}];
    for (const Seen& before : all) {
      if (before.value == seen.value) return;
    }
    const auto other = std::find_if(all.begin(), all.end(), [&](const Seen& before) {
      return differs(exploration_.looks(), before.value, seen.value);
    });
    if (other != all.end()) add(place, list, part, other->occasion, seen.occasion);
    all.push_back(seen);
  }

  void add(std::uint32_t place, std::uint32_t list, std::size_t part, const Occasion& first,
           const Occasion& second) {
    const auto [entry, isNew] = differences_.try_emplace(
        {list, part}, LookDifference{.list = list, .part = part, .first = first, .second = second});
    if (places_[{list, part}].insert(place).second) ++entry->second.places;
    static_cast<void>(isNew);
  }

  const Exploration& exploration_;
  std::map<std::tuple<std::uint32_t, std::uint32_t, std::size_t>, std::vector<Seen>> seen_;
  std::map<std::pair<std::uint32_t, std::size_t>, LookDifference> differences_;
  std::map<std::pair<std::uint32_t, std::size_t>, std::set<std::uint32_t>> places_;
};

}  // namespace

std::vector<std::size_t> Exploration::partsWithSeveralLooks(std::uint32_t place) const {
  std::vector<std::size_t> parts;
  const auto further = furtherLooks_.find(place);
  if (further == furtherLooks_.end()) return parts;
  for (std::size_t part = 0; part < format_.controls(); ++part) {
    if (!further->second[part].empty()) parts.push_back(part);
  }
  return parts;
}

std::vector<LookDifference> Exploration::lookDifferences(unsigned threads) {
  if (furtherLooks_.empty()) return {};
  Comparison comparison(*this);
  makeAllMoves(threads, [&](const Occasion& occasion, const Arrival& arrival,
                            std::uint32_t lastList, std::uint32_t place) {
    comparison.see(place, lastList, arrival.look, occasion);
  });
  return comparison.take();
}

void Exploration::makeAllMoves(unsigned threads, const See& see) {
  for (std::uint32_t number = 0; number < visits_.size(); ++number) {
    const Visit& visit = visits_[number];
    if (visit.parent != noVisit) continue;
    for (const Arrival& start : starts_) {
      if (start.move == visit.move) {
        see({noVisit, visit.move}, start, visit.lastList, visit.place);
      }
    }
  }
  std::vector<Expansion> expansions;
  for (std::uint32_t next = 0; next < visits_.size();) {
    expansions.resize(std::min<std::size_t>(Expansion::roundSize, visits_.size() - next));
    expandAll(expansions, next, threads);
    next += static_cast<std::uint32_t>(expansions.size());
    for (const Expansion& expansion : expansions) seeExpansion(expansion, see);
  }
}

void Exploration::seeExpansion(const Expansion& expansion, const See& see) {
  const Visit& visit = visits_[expansion.visit];
  for (std::size_t i = 0; i < expansion.found.size(); ++i) {
    const Arrival& arrival = expansion.found[i].arrival;
    if (arrival.isEndless) continue;
    if (const auto place = knownPlace(expansion, i)) {
      see({expansion.visit, arrival.move}, arrival, arrival.lastList.value_or(visit.lastList),
          *place);
    }
  }
}

}  // namespace qz::tools::check
