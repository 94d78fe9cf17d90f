// SPDX-License-Identifier: MIT
// Where the moves of a walk-through lead.
#include "tests/check/place_graph.hpp"

#include <algorithm>
#include <utility>

namespace qz::naive {

Step stepOf(const Move& move, const Trace& trace) {
  Step step;
  step.runsList = !trace.lists.empty();
  if (step.runsList) {
    step.list = trace.lists.front();
  } else if (move.kind == Move::Kind::press) {
    step.tag = move.tag;
  }
  return step;
}

void PlaceGraph::report(bool complete, Findings& findings) const {
  const Marks lively = canRunLists();
  reportDeadEnds(lively, findings);
  const bool ends =
      std::any_of(places.begin(), places.end(), [](const Place& place) { return place.hasEnded; });
  if (ends) reportTraps(lively, findings);
  if (!ends && complete) findings.add({"no-end", "", std::nullopt, std::nullopt, 0});
}

/// Marks, besides those marked, the places from which a step `goes` or leads to a marked place.
template <class Goes>
PlaceGraph::Marks PlaceGraph::reaching(Marks marks, Goes goes) const {
  for (bool changed = true; changed;) {
    changed = false;
    for (std::size_t i = 0; i < places.size(); ++i) {
      if (marks[i]) continue;
      const auto& steps = places[i].steps;
      marks[i] = std::any_of(steps.begin(), steps.end(), [&](const Step& step) {
        return step.isUnknown || goes(step) || (step.to && marks[*step.to]);
      });
      changed = changed || marks[i];
    }
  }
  return marks;
}

PlaceGraph::Marks PlaceGraph::canRunLists() const {
  return reaching(Marks(places.size()), [](const Step& step) { return step.runsList; });
}

PlaceGraph::Marks PlaceGraph::canEnd() const {
  Marks ended;
  for (const Place& place : places) ended.push_back(place.hasEnded);
  return reaching(std::move(ended), [](const Step&) { return false; });
}

PlaceGraph::Marks PlaceGraph::reachableFrom(std::size_t place) const {
  Marks marks(places.size());
  std::vector<std::size_t> open = {place};
  marks[place] = true;
  while (!open.empty()) {
    const std::size_t from = open.back();
    open.pop_back();
    for (const Step& step : places[from].steps) {
      if (!step.to || marks[*step.to]) continue;
      marks[*step.to] = true;
      open.push_back(*step.to);
    }
  }
  return marks;
}

void PlaceGraph::reportDeadEnds(const Marks& lively, Findings& findings) const {
  for (const Step& start : starts) reportDeadStep(start, 1, lively, findings);
  for (std::size_t i = 0; i < places.size(); ++i) {
    if (!lively[i]) continue;
    for (const Step& step : places[i].steps) {
      reportDeadStep(step, places[i].pathLength + 1, lively, findings);
    }
  }
}

void PlaceGraph::reportDeadStep(const Step& step, std::size_t pathLength, const Marks& lively,
                                Findings& findings) const {
  if (!step.to || lively[*step.to] || places[*step.to].hasEnded) return;
  findings.add({"dead-end", step.list, std::nullopt, step.tag, pathLength});
}

/// Whether every place that can be reached from the place leads back to it.
bool PlaceGraph::isClosed(std::size_t place) const {
  const Marks reached = reachableFrom(place);
  Marks self(places.size());
  self[place] = true;
  const Marks leadBack = reaching(std::move(self), [](const Step&) { return false; });
  for (std::size_t i = 0; i < places.size(); ++i) {
    if (reached[i] && !leadBack[i]) return false;
  }
  return true;
}

void PlaceGraph::reportTraps(const Marks& lively, Findings& findings) const {
  const Marks ending = canEnd();
  Marks done(places.size());
  for (std::size_t i = 0; i < places.size(); ++i) {
    if (ending[i] || !lively[i] || done[i] || !isClosed(i)) continue;
    const Marks members = reachableFrom(i);
    for (std::size_t k = 0; k < places.size(); ++k) done[k] = done[k] || members[k];
    reportTrap(members, findings);
  }
}

// The place with the shortest path stands for its set.
void PlaceGraph::reportTrap(const Marks& members, Findings& findings) const {
  const Place* first = nullptr;
  for (std::size_t i = 0; i < places.size(); ++i) {
    if (members[i] && (!first || places[i].pathLength < first->pathLength)) first = &places[i];
  }
  findings.addAnother(
      {"trap", first->arrival.list, std::nullopt, first->arrival.tag, first->pathLength});
}

}  // namespace qz::naive
