// SPDX-License-Identifier: MIT
#include "tools/check/expectation_check.hpp"

#include <algorithm>

#include "tools/support/text_layout.hpp"

namespace qz::tools::check {
namespace {

using Kind = Condition::Kind;
using Rule = Expectation::Rule;

Finding failureAfter(Path path, std::string message) {
  Finding finding = findingOf("expectation", std::move(message));
  finding.path = std::move(path);
  return finding;
}

}  // namespace

ExpectationCheck::ExpectationCheck(const Exploration& exploration,
                                   const std::vector<Expectation>& expectations)
    : exploration_(exploration), expectations_(expectations), evidence_(expectations.size()) {
  for (Evidence& evidence : evidence_) evidence.leadsThere.resize(exploration.places());
}

void ExpectationCheck::see(const Occasion& occasion, const Arrival& arrival, std::uint32_t place) {
  for (std::size_t i = 0; i < expectations_.size(); ++i) {
    const Expectation& expectation = expectations_[i];
    bool counts = meets(expectation.condition, arrival, place);
    if (expectation.rule == Rule::always) counts = !counts;
    if (expectation.rule == Rule::whenever) {
      counts = counts && !meets(*expectation.consequence, arrival, place);
    }
    if (counts) note(expectation, evidence_[i], occasion, place);
  }
}

void ExpectationCheck::note(const Expectation& expectation, Evidence& evidence,
                            const Occasion& occasion, std::uint32_t place) const {
  if (!evidence.first) {
    evidence.first = occasion;
    evidence.depth = occasion.visit == noVisit ? 0 : exploration_.depth(occasion.visit) + 1;
  }
  // A list runs on the way out of a place; all else is so at the place where the move leads.
  if (expectation.condition.kind != Kind::listRan) {
    evidence.leadsThere[place] = true;
  } else if (occasion.visit != noVisit) {
    evidence.leadsThere[exploration_.visits()[occasion.visit].place] = true;
  }
}

bool ExpectationCheck::meets(const Condition& condition, const Arrival& arrival,
                             std::uint32_t place) const {
  return isSo(condition, arrival, place) != condition.isNegated;
}

bool ExpectationCheck::isSo(const Condition& condition, const Arrival& arrival,
                            std::uint32_t place) const {
  const auto& format = exploration_.format();
  const std::uint8_t* const bytes = exploration_.place(place);
  if (condition.kind == Kind::end) return format.isOver(bytes);
  if (condition.kind == Kind::listRan) {
    const auto& ran = arrival.watchedLists;
    return std::any_of(condition.keys.begin(), condition.keys.end(), [&](const std::string& key) {
      const auto list = exploration_.setting().script.listUnder(key);
      return list && std::find(ran.begin(), ran.end(), *list) != ran.end();
    });
  }
  if (condition.kind == Kind::timer) {
    const PendingTimers& timers = exploration_.timers(place);
    return std::any_of(timers.begin(), timers.end(),
                       [&](const PendingTimer& each) { return each.key == condition.keys[0]; });
  }
  for (std::size_t i = 0; i < format.controls(); ++i) {  // commands find the backmost one
    if (isMeant(condition, format.control(bytes, i).tag)) {
      return isControlSo(condition, arrival, place, i);
    }
  }
  return false;
}

bool ExpectationCheck::isMeant(const Condition& condition, Tag tag) const {
  if (condition.name.empty()) return tag == condition.tag;
  const auto& names = exploration_.setting().plan.names.controls;
  const auto found = names.find(tag);
  return found != names.end() && found->second == condition.name;
}

bool ExpectationCheck::isControlSo(const Condition& condition, const Arrival& arrival,
                                   std::uint32_t place, std::size_t control) const {
  const ControlState state = exploration_.format().control(exploration_.place(place), control);
  Looks& looks = exploration_.looks();
  const ViewLook& look = looks.look(looks.parts(arrival.look)[control]);
  const SavedView& view = look.view;
  switch (condition.kind) {
    case Kind::hidden:
      return state.hidden;
    case Kind::shown:
      return !state.hidden;
    case Kind::enabled:
      return state.enabled;
    case Kind::disabled:
      return !state.enabled;
    case Kind::on:
      return !look.hasUsersState && view.state == toolkit::State::on;
    case Kind::off:
      return !look.hasUsersState && view.state == toolkit::State::off;
    case Kind::text:
      return view.text.string() == condition.word;
    case Kind::title:
      return view.title.string() == condition.word;
    case Kind::image:
      return view.image && view.image->name() == condition.word;
    case Kind::toolTip:
      return view.toolTip == condition.word;
    case Kind::end:
    case Kind::listRan:
    case Kind::timer:
      break;
  }
  return false;
}

std::vector<Finding> ExpectationCheck::findings() {
  std::vector<Finding> findings;
  for (std::size_t i = 0; i < expectations_.size(); ++i) {
    auto finding = judge(expectations_[i], evidence_[i]);
    if (!finding) continue;
    finding->elsewhere = expectations_[i].place;
    finding->expectation = expectations_[i].words;
    findings.push_back(*std::move(finding));
    ++counts_.fail;
  }
  counts_.hold = expectations_.size() - counts_.fail - counts_.open;
  return findings;
}

std::optional<Finding> ExpectationCheck::judge(const Expectation& expectation, Evidence& evidence) {
  const std::string failed = quote(expectation.words) + " does not hold";
  const bool isWish = expectation.rule == Rule::canReach || expectation.rule == Rule::within;
  if (expectation.rule == Rule::alwaysCanReach) return judgeAlways(expectation, evidence);
  if (!isWish && evidence.first) {
    return failureAfter(exploration_.path(*evidence.first), failed + " after this path");
  }
  if (isWish && evidence.first &&
      (expectation.rule == Rule::canReach || evidence.depth <= expectation.moves)) {
    return std::nullopt;
  }
  const bool isTooFar = isWish && evidence.first;
  if (!isTooFar && !exploration_.isComplete()) {
    ++counts_.open;
    return std::nullopt;
  }
  if (!isWish) return std::nullopt;
  if (!isTooFar) {
    return findingOf("expectation",
                     failed + ": it never happens in all the places that can be reached (" +
                         std::to_string(exploration_.places()) + ")");
  }
  return failureAfter(exploration_.path(*evidence.first),
                      failed + ": the shortest path needs " + std::to_string(evidence.depth) +
                          (evidence.depth == 1 ? " move" : " moves"));
}

std::optional<Finding> ExpectationCheck::judgeAlways(const Expectation& expectation,
                                                     Evidence& evidence) {
  if (!exploration_.isComplete()) {
    ++counts_.open;
    return std::nullopt;
  }
  const auto stuck = placeWithoutWay(std::move(evidence.leadsThere));
  if (!stuck) return std::nullopt;
  return failureAfter(
      exploration_.path(exploration_.firstVisit(*stuck)),
      quote(expectation.words) + " does not hold: after this path no way leads there any more");
}

/// Returns the first place before the end from which no way leads to the marked places.
std::optional<std::uint32_t> ExpectationCheck::placeWithoutWay(std::vector<bool> leadsThere) const {
  const auto count = static_cast<std::uint32_t>(exploration_.places());
  std::vector<std::vector<std::uint32_t>> sources(count);
  std::vector<std::uint32_t> open;
  for (std::uint32_t place = 0; place < count; ++place) {
    for (const std::uint32_t target : exploration_.successors(place)) {
      sources[target].push_back(place);
    }
    if (leadsThere[place]) open.push_back(place);
  }
  while (!open.empty()) {
    const std::uint32_t place = open.back();
    open.pop_back();
    for (const std::uint32_t source : sources[place]) {
      if (leadsThere[source]) continue;
      leadsThere[source] = true;
      open.push_back(source);
    }
  }
  for (std::uint32_t place = 0; place < count; ++place) {
    if (!leadsThere[place] && !exploration_.format().isOver(exploration_.place(place))) {
      return place;
    }
  }
  return std::nullopt;
}

}  // namespace qz::tools::check
