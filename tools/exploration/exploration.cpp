// SPDX-License-Identifier: MIT
// Visits are expanded in rounds: any number of worlds make the moves, and look up what is known of
// where they lead. Then one thread adds what they found in the order of the visits, so the result
// does not depend on the number of threads. Meanwhile the others make the moves of the next round.
#include "tools/exploration/exploration.hpp"

#include <algorithm>
#include <chrono>
#include <thread>

#include "tools/exploration/expansion.hpp"

namespace qz::tools::check {
namespace {

constexpr std::size_t worthThreads = 64;  // visits; below, threads cost more than they save
constexpr std::size_t edgeBytes = 3;
constexpr std::size_t placesOfABase = 64;
constexpr std::size_t mostPlaces = (std::size_t{1} << (8 * edgeBytes)) - 1;

std::vector<Tag> allTags(const Setting& setting) {
  std::vector<Tag> tags = setting.script.newTags();
  for (const Tag tag : setting.ownTags) {
    tags.push_back(tag);
    tags.push_back(restoredTag(tag));
  }
  return tags;
}

}  // namespace

Exploration::Exploration(const Setting& setting, std::vector<std::string> startKeys)
    : setting_(setting),
      startKeys_(std::move(startKeys)),
      format_(setting.ownTags.size(), allTags(setting)),
      set_(format_.size()) {
  numberOf({});
}

void Exploration::run(const ExplorationLimits& limits, unsigned threads, ExplorationHooks hooks) {
  const auto began = std::chrono::steady_clock::now();
  const auto isLate = [&] {
    const std::chrono::duration<double> passed = std::chrono::steady_clock::now() - began;
    return limits.seconds && passed.count() > *limits.seconds;
  };
  hooks_ = std::move(hooks);
  const std::size_t most = std::min(limits.places, mostPlaces);
  start();
  const auto isOverLimit = [&] {
    if (set_.count() >= most) stop_ = Stop::places;
    if (isLate()) stop_ = Stop::time;
    if (bytes() > limits.bytes) stop_ = Stop::memory;
    if (hooks_.isCancelled()) stop_ = Stop::cancelled;
    return stop_ != Stop::none;
  };
  useThreads(threads);
  Round round;
  Round coming;
  for (std::size_t next = 0; next < visits_.size() && !isOverLimit();) {
    const std::size_t left = std::max(most - set_.count(), worthThreads);
    if (round.empty()) {
      prepare(round, next, left);
      doAll(round, &Exploration::makeMoves);
    }
    doAll(round, &Exploration::lookUpAll);
    prepare(coming, next + round.size(), left);
    doAll(coming, &Exploration::makeMoves, [&] { next += mergeAll(round, most); });
    round.swap(coming);
    hooks_.report({set_.count(), visits_.size() - next});
  }
}

// A round is short where places are large, so that it takes little memory and can be cancelled.
std::size_t Exploration::roundSize() const {
  constexpr std::size_t roundBytes = std::size_t{1} << 20U;  // what near caches hold
  const auto buttons = static_cast<std::size_t>(
      std::count_if(setting_.kinds.begin(), setting_.kinds.end(), drivers::isButton));
  const std::size_t each = (buttons + 1) * (format_.size() + sizeof(Found));
  return std::clamp<std::size_t>(roundBytes / each, 1, Expansion::largestRound);
}

std::size_t Exploration::bytes() const {
  const std::size_t perLook = (format_.controls() + 2) * sizeof(LookValue) + sizeof(Looks::Parts);
  return set_.count() * (format_.size() + 2 * sizeof(std::uint32_t)) + edges_.size() +
         visits_.size() * sizeof(Visit) + looks_.count() * perLook +
         furtherLooks_.size() * perLook * sizeof(std::vector<LookValue>) / sizeof(LookValue);
}

void Exploration::start() {
  worlds_.push_back(std::make_unique<World>(setting_, format_, looks_));
  World& world = *worlds_.front();
  firstLook_ = world.look();
  for (std::size_t i = 0; i < startKeys_.size(); ++i) {
    const Occasion occasion{noVisit, static_cast<Move>(i)};
    std::vector<std::uint8_t> place(format_.size());
    Found found;
    Arrival& arrival = found.arrival;
    arrival = world.start(startKeys_[i], found.timers, place.data());
    for (const Fact& fact : world.facts()) facts_.add(fact, occasion, noPlace);
    if (arrival.isEndless) continue;
    arrival.move = occasion.move;
    starts_.push_back(arrival);
    arrive(found, place.data(), noVisit, arrival.lastList.value_or(noList));
  }
}

void Exploration::useThreads(unsigned threads) { threads_ = std::max(threads, 1U); }

void Exploration::prepare(Round& round, std::size_t first, std::size_t most) const {
  round.resize(std::min({roundSize(), visits_.size() - first, most}));
  for (std::size_t i = 0; i < round.size(); ++i) {
    const Visit& visit = visits_[first + i];
    Expansion& expansion = round[i];
    expansion.visit = static_cast<std::uint32_t>(first + i);
    expansion.look = visit.look;
    expansion.from = set_.place(visit.place);
    expansion.parts = &looks_.parts(visit.look);
    expansion.pending = &timers(visit.place);
  }
}

void Exploration::doAll(Round& round, Job job, const std::function<void()>& meanwhile) {
  std::atomic<std::size_t> taken = 0;
  const auto work = [&](World& world) {
    constexpr std::size_t share = 16;  // visits that a thread takes at a time
    for (std::size_t begin = taken.fetch_add(share); begin < round.size();
         begin = taken.fetch_add(share)) {
      const std::size_t end = std::min(begin + share, round.size());
      for (std::size_t i = begin; i < end; ++i) (this->*job)(world, round[i]);
    }
  };
  const auto workHere = [&] {
    meanwhile();
    work(*worlds_.front());
  };
  if (round.size() < worthThreads || threads_ == 1) return workHere();
  while (worlds_.size() < threads_) {
    worlds_.push_back(std::make_unique<World>(setting_, format_, looks_));
  }
  if (!workers_) workers_.emplace(threads_ - 1);
  workers_->run([&](std::size_t worker) { work(*worlds_[worker + 1]); }, workHere);
}

void Exploration::makeMoves(World& world, Expansion& expansion) const {
  const Station from{expansion.from, expansion.look, *expansion.parts};
  const auto moves = world.moves(from.place, *expansion.pending);
  expansion.found.resize(moves.size());
  expansion.places.resize(moves.size() * format_.size());
  expansion.facts.clear();
  for (std::size_t i = 0; i < moves.size(); ++i) {
    Found& found = expansion.found[i];
    std::uint8_t* const place = expansion.places.data() + i * format_.size();
    found.firstFact = expansion.facts.size();
    found.arrival = world.make(moves[i], from, *expansion.pending, found.timers, place);
    const auto& facts = world.facts();
    expansion.facts.insert(expansion.facts.end(), facts.begin(), facts.end());
  }
}

// Places are looked up together, so that the processor waits for the memory of many at a time.
void Exploration::lookUpAll(World&, Expansion& expansion) const {
  const auto placeOf = [&](std::size_t i) { return expansion.places.data() + i * format_.size(); };
  for (std::size_t i = 0; i < expansion.found.size(); ++i) hash(expansion.found[i], placeOf(i));
  for (const Found& found : expansion.found) {
    if (found.hash) set_.prefetchPlace(*found.hash);
  }
  const Visit& visit = visits_[expansion.visit];
  for (std::size_t i = 0; i < expansion.found.size(); ++i) {
    lookUp(expansion.found[i], placeOf(i), visit);
  }
  summarize(expansion);
}

void Exploration::summarize(Expansion& expansion) {
  expansion.known.clear();
  expansion.waits = 0;
  expansion.runsList = false;
  for (const Found& found : expansion.found) {
    expansion.known.push_back(found.isNews ? noPlace : *found.place);
    expansion.waits += found.arrival.move == waitMove;
    expansion.runsList |= found.arrival.ranList || found.arrival.isEndless;
  }
}

// Timers that were not seen before get their number later.
void Exploration::hash(Found& found, std::uint8_t* place) const {
  found.hash.reset();
  if (found.arrival.isEndless) return;
  const auto number = knownNumberOf(found.timers);
  if (!number) return;
  format_.setTimers(place, *number);
  found.hash = PlaceSet::hashOf(place, format_.size());
  set_.prefetchSlot(*found.hash);
}

// Most moves lead to what is known.
void Exploration::lookUp(Found& found, const std::uint8_t* place, const Visit& from) const {
  found.place.reset();
  found.isNews = true;
  if (!found.hash) return;
  found.place = set_.find(place, *found.hash);
  if (!found.place || !found.timers.empty()) return;
  const Situation situation =
      situationOf(*found.place, found.arrival.lastList.value_or(from.lastList));
  const auto first = knownVisitIn(situation);
  found.isNews = !first || visits_[*first].look != found.arrival.look;
}

/// Returns how many visits were merged before there were too many places.
std::size_t Exploration::mergeAll(Round& round, std::size_t limit) {
  std::size_t merged = 0;
  for (; merged < round.size() && set_.count() < limit; ++merged) merge(round[merged]);
  return merged;
}

void Exploration::merge(Expansion& expansion) {
  const Visit from = visits_[expansion.visit];
  const bool isFirst = firstVisit_[from.place] == expansion.visit;
  addFacts(expansion, isFirst ? from.place : noPlace);
  targets_.clear();
  for (std::size_t i = 0; i < expansion.known.size(); ++i) {
    if (expansion.known[i] != noPlace) {
      targets_.push_back(expansion.known[i]);
      continue;
    }
    Found& found = expansion.found[i];
    if (found.arrival.isEndless) continue;
    targets_.push_back(arrive(found, expansion.places.data() + i * format_.size(), expansion.visit,
                              found.arrival.lastList.value_or(from.lastList)));
  }
  if (!isFirst) return;
  waits_ += expansion.waits;
  presses_ += expansion.known.size() - expansion.waits;
  runsList_.push_back(expansion.runsList);
  addEdges(targets_);
}

void Exploration::addFacts(const Expansion& expansion, std::uint32_t place) {
  std::size_t move = 0;
  for (std::size_t fact = 0; fact < expansion.facts.size(); ++fact) {
    while (move + 1 < expansion.found.size() && expansion.found[move + 1].firstFact <= fact) ++move;
    facts_.add(expansion.facts[fact], {expansion.visit, expansion.found[move].arrival.move}, place);
  }
}

std::uint32_t Exploration::arrive(Found& found, std::uint8_t* place, std::uint32_t parent,
                                  std::uint32_t lastList) {
  const Arrival& arrival = found.arrival;
  if (!found.hash) {
    format_.setTimers(place, numberOf(found.timers));
    found.hash = PlaceSet::hashOf(place, format_.size());
  }
  const auto known = found.place ? found.place : set_.find(place, *found.hash);
  const Visit visit{.place = known ? *known : set_.add(place, *found.hash),
                    .look = arrival.look,
                    .parent = parent,
                    .move = arrival.move,
                    .lastList = lastList};
  if (!known) firstVisit_.push_back(static_cast<std::uint32_t>(visits_.size()));
  if (isNews(visit) || !known) visits_.push_back(visit);
  for (const std::uint32_t element : arrival.timerElements) {
    timerStarts_.try_emplace({visit.place, element}, Occasion{visit.parent, visit.move});
  }
  return visit.place;
}

bool Exploration::isNews(const Visit& visit) {
  const Situation situation = situationOf(visit.place, visit.lastList);
  const auto known = knownVisitIn(situation);
  if (!known) otherFirstVisits_.emplace(situation, static_cast<std::uint32_t>(visits_.size()));
  if (!known || *known == visits_.size()) return true;
  const Visit& first = visits_[*known];
  if (visit.look == first.look) return false;
  bool isNew = setting_.wholeLooks && wholeLooks_.insert({visit.place, visit.look}).second;
  const Looks::Parts& parts = looks_.parts(visit.look);
  const Looks::Parts& knownParts = looks_.parts(first.look);
  auto& further = furtherLooks_[situation];
  further.resize(parts.size());
  for (std::size_t i = 0; i < parts.size(); ++i) {
    if (parts[i] == knownParts[i]) continue;
    auto& values = further[i];
    if (std::find(values.begin(), values.end(), parts[i]) != values.end()) continue;
    values.push_back(parts[i]);
    isNew = true;
  }
  return isNew;
}

// Which list had the last word matters after an end, and where a press without a list leads to
// another place because it cancels timers.
Exploration::Situation Exploration::situationOf(std::uint32_t place, std::uint32_t lastList) const {
  const std::uint8_t* const bytes = set_.place(place);
  const bool matters = format_.isOver(bytes) || format_.timers(bytes) != 0;
  return {place, matters ? lastList : noList};
}

std::optional<std::uint32_t> Exploration::knownVisitIn(const Situation& situation) const {
  const auto [place, list] = situation;
  const std::uint32_t first = firstVisit_[place];
  const bool isComing = first == visits_.size();
  if (isComing || list == noList || visits_[first].lastList == list) return first;
  const auto other = otherFirstVisits_.find(situation);
  return other == otherFirstVisits_.end() ? std::nullopt : std::optional(other->second);
}

std::vector<std::size_t> Exploration::partsWithSeveralLooks(std::uint32_t place) const {
  std::set<std::size_t> several;
  for (auto further = furtherLooks_.lower_bound({place, 0});
       further != furtherLooks_.end() && further->first.first == place; ++further) {
    for (std::size_t part = 0; part < further->second.size(); ++part) {
      if (!further->second[part].empty()) several.insert(part);
    }
  }
  return {several.begin(), several.end()};
}

void Exploration::makeAllMoves(unsigned threads, const See& see) {
  if (stop_ == Stop::time || stop_ == Stop::cancelled) return;
  for (const Visit& visit : visits_) {
    if (visit.parent != noVisit) continue;
    for (const Arrival& start : starts_) {
      if (start.move == visit.move) {
        see({noVisit, visit.move}, start, visit.lastList, visit.place);
      }
    }
  }
  useThreads(threads);
  Round round;
  for (std::size_t next = 0; next < visits_.size(); next += round.size()) {
    if (hooks_.isCancelled()) return;
    prepare(round, next, visits_.size());
    doAll(round, &Exploration::makeMoves);
    doAll(round, &Exploration::lookUpAll);
    for (const Expansion& expansion : round) seeExpansion(expansion, see);
  }
}

void Exploration::seeExpansion(const Expansion& expansion, const See& see) {
  const Visit& visit = visits_[expansion.visit];
  for (std::size_t i = 0; i < expansion.found.size(); ++i) {
    const Arrival& arrival = expansion.found[i].arrival;
    const auto place = expansion.found[i].place;
    if (arrival.isEndless || !place) continue;
    see({expansion.visit, arrival.move}, arrival, arrival.lastList.value_or(visit.lastList),
        *place);
  }
}

std::uint32_t Exploration::numberOf(const PendingTimers& timers) {
  const auto [place, isNew] =
      timerNumbers_.emplace(timers, static_cast<std::uint32_t>(timers_.size()));
  if (isNew) timers_.push_back(&place->first);
  return place->second;
}

std::optional<std::uint32_t> Exploration::knownNumberOf(const PendingTimers& timers) const {
  if (timers.empty()) return 0;
  const auto number = timerNumbers_.find(timers);
  return number == timerNumbers_.end() ? std::nullopt : std::optional(number->second);
}

void Exploration::addEdges(const std::vector<std::uint32_t>& targets) {
  if (edgeOffset_.size() % placesOfABase == 0) edgeBase_.push_back(edges_.size());
  edgeOffset_.push_back(static_cast<std::uint32_t>(edges_.size() - edgeBase_.back()));
  edges_.resize(edges_.size() + targets.size() * edgeBytes);
  std::uint8_t* end = edges_.data() + edges_.size() - targets.size() * edgeBytes;
  for (const std::uint32_t target : targets) {
    for (std::size_t byte = 0; byte < edgeBytes; ++byte) {
      *end++ = static_cast<std::uint8_t>(target >> 8 * byte);
    }
  }
}

std::vector<std::uint32_t> Exploration::successors(std::uint32_t place) const {
  std::vector<std::uint32_t> targets(successorCount(place));
  for (std::size_t i = 0; i < targets.size(); ++i) targets[i] = successor(place, i);
  return targets;
}

std::size_t Exploration::successorCount(std::uint32_t place) const {
  if (!isExpanded(place)) return 0;
  const std::size_t end = isExpanded(place + 1) ? edgeStart(place + 1) : edges_.size();
  return (end - edgeStart(place)) / edgeBytes;
}

std::size_t Exploration::edgeStart(std::uint32_t place) const {
  return edgeBase_[place / placesOfABase] + edgeOffset_[place];
}

std::uint32_t Exploration::successor(std::uint32_t place, std::size_t index) const {
  const std::uint8_t* const bytes = edges_.data() + edgeStart(place) + index * edgeBytes;
  std::uint32_t target = 0;
  for (std::size_t byte = edgeBytes; byte-- > 0;) target = target << 8U | bytes[byte];
  return target;
}

Step Exploration::stepFrom(std::uint32_t place, Move move) const {
  if (move == waitMove) return WaitMove{timers(place).front().seconds};
  const std::uint8_t* const bytes = set_.place(place);
  PressMove press{.tag = format_.control(bytes, move).tag, .control = move};
  for (std::size_t i = 0; i < move; ++i) {
    press.isShadowed |= format_.control(bytes, i).tag == press.tag;
  }
  return press;
}

Step Exploration::step(const Visit& visit) const {
  if (visit.parent == noVisit) return StartMove{startKeys_[visit.move]};
  return stepFrom(visits_[visit.parent].place, visit.move);
}

Path Exploration::path(std::uint32_t visit) const {
  Path path;
  for (; visit != noVisit; visit = visits_[visit].parent) path.push_back(step(visits_[visit]));
  std::reverse(path.begin(), path.end());
  return path;
}

Path Exploration::path(const Occasion& occasion) const {
  if (occasion.visit == noVisit) return {StartMove{startKeys_[occasion.move]}};
  Path path = this->path(occasion.visit);
  path.push_back(stepFrom(visits_[occasion.visit].place, occasion.move));
  return path;
}

std::size_t Exploration::depth(std::uint32_t visit) const {
  std::size_t depth = 0;
  for (; visits_[visit].parent != noVisit; visit = visits_[visit].parent) ++depth;
  return depth;
}

std::optional<std::uint32_t> Exploration::taggerAt(const Visit& visit, std::size_t control) const {
  if (!setting_.tracksTaggers) return std::nullopt;
  const Looks::Parts& parts = looks_.parts(visit.look);
  const LookValue tagger = parts[parts.size() - format_.controls() + control];
  return tagger == 0 ? std::nullopt : std::optional<std::uint32_t>(tagger - 1);
}

bool Exploration::leavesTags() const {
  if (setting_.plan.description) {
    return false;  // the engine's own window has no control of the host
  }
  for (std::uint32_t number = 0; number < places(); ++number) {
    const std::uint8_t* const bytes = place(number);
    if (!format_.isOver(bytes)) continue;
    for (std::size_t i = 0; i < format_.controls(); ++i) {
      if (format_.control(bytes, i).tag != setting_.ownTags[i]) return true;
    }
  }
  return false;
}

std::unique_ptr<Exploration> explore(Setting& setting, const std::vector<std::string>& startKeys,
                                     const ExplorationLimits& limits, unsigned threads,
                                     const ExplorationHooks& hooks) {
  auto exploration = std::make_unique<Exploration>(setting, startKeys);
  exploration->run(limits, threads, hooks);
  if (!exploration->leavesTags()) return exploration;
  setting.tracksTaggers = true;
  exploration = std::make_unique<Exploration>(setting, startKeys);
  exploration->run(limits, threads, hooks);
  return exploration;
}

}  // namespace qz::tools::check
