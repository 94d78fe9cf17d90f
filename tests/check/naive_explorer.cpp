// SPDX-License-Identifier: MIT
// Explores breadth first, so that the first path to anything is a shortest one.
#include "tests/check/naive_explorer.hpp"

#include <algorithm>
#include <deque>
#include <map>
#include <optional>
#include <stdexcept>
#include <utility>

#include "tests/check/command_facts.hpp"
#include "tests/check/endings.hpp"
#include "tests/check/looks.hpp"
#include "tests/check/place_graph.hpp"
#include "tests/check/world.hpp"

namespace qz::naive {

namespace {

using Path = std::vector<Move>;

std::vector<drivers::ViewKind> kindsOf(const HostWindow& host) {
  std::vector<drivers::ViewKind> kinds;
  for (const auto& control : host.controls) kinds.push_back(control.kind);
  return kinds;
}

class Explorer {
 public:
  Explorer(Script script, const HostWindow& host, std::string resources, std::size_t placeLimit)
      : script_(std::move(script)),
        host_(host),
        resources_(std::move(resources)),
        placeLimit_(placeLimit),
        facts_(script_, kindsOf(host)),
        endings_(script_, host, resources_) {}

  Exploration explore(const std::vector<std::string>& startKeys);

 private:
  /// A path that is worth following, and the place that it leads to.
  struct Lead {
    Path path;
    std::size_t place;
  };

  Step follow(const Path& before, const Move& move);
  void notePressing(const World& world, const Move& move, std::size_t pathLength);
  Step arrive(const World& world, const Path& path, Step step);
  std::optional<std::size_t> placeOf(const World& world, std::size_t pathLength, const Step& step);
  void expand(const Lead& lead);
  void noteStep(std::size_t place, std::size_t move, const Step& step);
  bool hasList(toolkit::Tag tag) const;
  void reportButtons(Findings& findings) const;
  Exploration result() const;

  Script script_;
  const HostWindow& host_;
  std::string resources_;
  std::size_t placeLimit_;
  bool complete_ = true;
  std::map<std::string, std::size_t> indexOf_;
  PlaceGraph graph_;
  std::deque<Lead> leads_;
  CommandFacts facts_;
  Looks looks_;
  Endings endings_;
  Findings presses_;  // what presses of buttons without a list did
};

bool Explorer::hasList(toolkit::Tag tag) const {
  return static_cast<bool>(script_->objectForKey(std::to_string(tag)));
}

Exploration Explorer::explore(const std::vector<std::string>& startKeys) {
  for (const std::string& key : startKeys) {
    graph_.starts.push_back(follow({}, {.kind = Move::Kind::start, .key = key}));
  }
  while (!leads_.empty()) {
    const Lead lead = std::move(leads_.front());
    leads_.pop_front();
    expand(lead);
  }
  return result();
}

void Explorer::expand(const Lead& lead) {
  const std::size_t count = graph_.places[lead.place].moves.size();
  for (std::size_t i = 0; i < count; ++i) {
    const Move move = graph_.places[lead.place].moves[i];
    noteStep(lead.place, i, follow(lead.path, move));
  }
}

// Another path to the same place must not lead elsewhere: a place is all that matters.
void Explorer::noteStep(std::size_t place, std::size_t move, const Step& step) {
  auto& steps = graph_.places[place].steps;
  if (move == steps.size()) {
    steps.push_back(step);
  } else if (steps[move].to != step.to || steps[move].runsList != step.runsList) {
    throw std::logic_error("what happens depends on more than the place: " +
                           graph_.places[place].text);
  }
}

/// Replays the path in a new world, then makes the move.
Step Explorer::follow(const Path& before, const Move& move) {
  World world(script_, host_, resources_);
  for (const Move& earlier : before) world.perform(earlier);
  Path path = before;
  path.push_back(move);
  notePressing(world, move, path.size());
  const Trace trace = world.perform(move);
  facts_.note(trace, path.size());
  Step step = stepOf(move, trace);
  return trace.endless ? step : arrive(world, path, std::move(step));
}

void Explorer::notePressing(const World& world, const Move& move, std::size_t pathLength) {
  if (move.kind != Move::Kind::press || hasList(move.tag)) return;
  for (const auto& [key, start] : world.history().starters) {
    presses_.add("timer-lost", start.site, move.tag, pathLength);
  }
}

Step Explorer::arrive(const World& world, const Path& path, Step step) {
  step.to = placeOf(world, path.size(), step);
  step.isUnknown = !step.to;
  if (world.hasEnded()) endings_.note(world, path.size());
  if (step.to && looks_.note(*step.to, world, path.size())) leads_.push_back({path, *step.to});
  return step;
}

std::optional<std::size_t> Explorer::placeOf(const World& world, std::size_t pathLength,
                                             const Step& step) {
  const std::string text = world.place();
  const auto known = indexOf_.find(text);
  if (known != indexOf_.end()) return known->second;
  if (indexOf_.size() >= placeLimit_) {
    complete_ = false;
    return std::nullopt;
  }
  const std::size_t index = graph_.places.size();
  indexOf_[text] = index;
  graph_.places.push_back({text, pathLength, world.hasEnded(), world.moves(), {}, step});
  return index;
}

void Explorer::reportButtons(Findings& findings) const {
  for (const Place& place : graph_.places) {
    for (const Move& move : place.moves) {
      if (move.kind != Move::Kind::press || hasList(move.tag)) continue;
      findings.add({"no-list", "", std::nullopt, move.tag, place.pathLength});
    }
  }
}

Exploration Explorer::result() const {
  Exploration exploration;
  exploration.complete = complete_;
  for (const Place& place : graph_.places) {
    exploration.places.insert(place.text);
    for (const Move& move : place.moves) {
      ++(move.kind == Move::Kind::wait ? exploration.waits : exploration.presses);
    }
  }
  Findings findings;
  facts_.report(complete_, findings);
  graph_.report(complete_, findings);
  looks_.report(findings);
  endings_.report(findings);
  for (const Finding& finding : presses_.all()) findings.add(finding);
  reportButtons(findings);
  exploration.findings = findings.all();
  return exploration;
}

}  // namespace

Exploration explore(const toolkit::ValueRef<toolkit::Dictionary>& script,
                    const tools::walkthrough::HostWindow& host,
                    const std::vector<std::string>& startKeys, std::size_t placeLimit,
                    const std::string& resources) {
  Explorer explorer(script, host, resources, placeLimit);
  return explorer.explore(startKeys.empty() ? std::vector<std::string>{""} : startKeys);
}

}  // namespace qz::naive
