// SPDX-License-Identifier: MIT
// Goes through everything that a user can do: every place, every move, breadth first.
#pragma once

#include <atomic>
#include <cstdint>
#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <set>
#include <string>
#include <unordered_map>
#include <vector>

#include "tools/exploration/facts.hpp"
#include "tools/exploration/looks.hpp"
#include "tools/exploration/move.hpp"
#include "tools/exploration/place.hpp"
#include "tools/exploration/place_set.hpp"
#include "tools/exploration/workers.hpp"
#include "tools/exploration/world.hpp"

namespace qz::tools::check {

/// One way of being at a place: with a look that was not seen there before. The first visit of a
/// place finds the place. The visits are in the order of their finding, so a later visit has no
/// shorter path.
struct Visit {
  std::uint32_t place = 0;
  std::uint32_t look = 0;
  std::uint32_t parent = 0;    ///< the visit before the move; `noVisit` for a start
  Move move = 0;               ///< from the parent; for a start, the index of its key
  std::uint32_t lastList = 0;  ///< whose command ran last
};

inline constexpr std::uint32_t noVisit = 0xffffffff;
inline constexpr std::uint32_t noList = 0xffffffff;

struct ExplorationLimits {
  std::size_t places = 1'000'000;
  std::size_t bytes = std::size_t{4} << 30U;  ///< of memory that what was explored takes, about
  std::optional<double> seconds;
};

/// How far an exploration has come.
struct Progress {
  std::size_t places = 0;
  std::size_t frontier = 0;  ///< how many visits wait for their moves
};

/// Called while an exploration works, about every tenth of a second.
struct ExplorationHooks {
  std::function<void(const Progress&)> report = [](const Progress&) {};
  std::function<bool()> isCancelled = [] { return false; };
};

/// Why an exploration is not complete.
enum class Stop : std::uint8_t { none, places, memory, time, cancelled };

class Exploration {
 public:
  Exploration(const Setting& setting, std::vector<std::string> startKeys);

  /// Explores until everything is known, a limit is reached, or `hooks` cancel.
  void run(const ExplorationLimits& limits, unsigned threads, ExplorationHooks hooks);

  const Setting& setting() const { return setting_; }
  const PlaceFormat& format() const { return format_; }
  bool isComplete() const { return stop_ == Stop::none; }
  Stop stop() const { return stop_; }
  std::size_t places() const { return set_.count(); }
  /// Returns how many places have all their moves made.
  std::size_t expandedPlaces() const { return edgeOffset_.size(); }
  std::size_t presses() const { return presses_; }
  std::size_t waits() const { return waits_; }
  const std::uint8_t* place(std::uint32_t number) const { return set_.place(number); }
  const PendingTimers& timers(std::uint32_t place) const {
    return *timers_[format_.timers(set_.place(place))];
  }
  const FactTable& facts() const { return facts_; }
  const std::vector<Visit>& visits() const { return visits_; }
  Looks& looks() const { return looks_; }
  const std::vector<std::string>& startKeys() const { return startKeys_; }

  /// Returns the path of a visit, or of a visit and a move out of it.
  Path path(std::uint32_t visit) const;
  Path path(const Occasion& occasion) const;
  /// Returns a move out of a place.
  Step stepFrom(std::uint32_t place, Move move) const;
  /// Returns the number of moves after the start.
  std::size_t depth(std::uint32_t visit) const;

  /// Returns the places to which the moves out of a place lead, in the order of the moves.
  std::vector<std::uint32_t> successors(std::uint32_t place) const;
  /// Returns how many of them there are, and the one at an index.
  std::size_t successorCount(std::uint32_t place) const;
  std::uint32_t successor(std::uint32_t place, std::size_t index) const;
  /// Whether a move out of the place runs a list.
  bool canRunList(std::uint32_t place) const { return runsList_[place]; }
  /// Whether the moves out of the place are known.
  bool isExpanded(std::uint32_t place) const { return place < expandedPlaces(); }
  /// Returns the first visit of a place.
  std::uint32_t firstVisit(std::uint32_t place) const { return firstVisit_[place]; }
  /// Makes every move once more, starts included, and tells `see` where each leads.
  using See = std::function<void(const Occasion& occasion, const Arrival& arrival,
                                 std::uint32_t lastList, std::uint32_t place)>;
  void makeAllMoves(unsigned threads, const See& see);
  /// Returns when each element first left a timer pending at each place.
  const std::map<std::pair<std::uint32_t, std::uint32_t>, Occasion>& timerStarts() const {
    return timerStarts_;
  }
  /// Returns the index of the element that gave a control the tag that it has at a visit; absent if
  /// none did, or if that is not tracked.
  std::optional<std::uint32_t> taggerAt(const Visit& visit, std::size_t control) const;
  /// Whether some end leaves a control another tag than its own.
  bool leavesTags() const;
  /// Returns the first part of a look that says whether a tag flashes; they are in the order of the
  /// setting's keys.
  std::size_t firstFlashPart() const { return format_.controls() + 2; }
  /// Returns the look of the window before the start.
  std::uint32_t firstLook() const { return firstLook_; }
  /// Whether some place can have several looks where the same list had the last word.
  bool hasSeveralLooks() const { return !furtherLooks_.empty(); }
  /// Returns the parts of the look that can have several values at a place where the same list had
  /// the last word.
  std::vector<std::size_t> partsWithSeveralLooks(std::uint32_t place) const;

 private:
  struct Found;      // where a move leads
  struct Expansion;  // of one visit: where its moves lead
  /// A place, and the list that had the last word, if that matters for what follows.
  using Situation = std::pair<std::uint32_t, std::uint32_t>;

  /// Visits that are expanded together.
  using Round = std::vector<Expansion>;
  /// What is done for each visit of a round.
  using Job = void (Exploration::*)(World&, Expansion&) const;

  std::size_t roundSize() const;
  std::size_t bytes() const;

  void start();
  void useThreads(unsigned threads);
  void prepare(Round& round, std::size_t first, std::size_t most) const;
  void doAll(
      Round& round, Job job, const std::function<void()>& meanwhile = [] {});
  void makeMoves(World& world, Expansion& expansion) const;
  void lookUpAll(World& world, Expansion& expansion) const;
  static void summarize(Expansion& expansion);
  void hash(Found& found, std::uint8_t* place) const;
  void lookUp(Found& found, const std::uint8_t* place, const Visit& from) const;
  std::size_t mergeAll(Round& round, std::size_t limit);
  void merge(Expansion& expansion);
  void addFacts(const Expansion& expansion, std::uint32_t place);
  std::uint32_t arrive(Found& found, std::uint8_t* place, std::uint32_t parent,
                       std::uint32_t lastList);
  bool isNews(const Visit& visit);
  Situation situationOf(std::uint32_t place, std::uint32_t lastList) const;
  /// Returns the first visit in a situation: a coming one, if the place is new.
  std::optional<std::uint32_t> knownVisitIn(const Situation& situation) const;
  void seeExpansion(const Expansion& expansion, const See& see);
  std::uint32_t numberOf(const PendingTimers& timers);
  std::optional<std::uint32_t> knownNumberOf(const PendingTimers& timers) const;
  Step step(const Visit& visit) const;
  void addEdges(const std::vector<std::uint32_t>& targets);
  std::size_t edgeStart(std::uint32_t place) const;

  const Setting& setting_;
  std::vector<std::string> startKeys_;
  PlaceFormat format_;
  mutable Looks looks_;  // giving numbers changes nothing for others
  PlaceSet set_;
  FactTable facts_;
  std::vector<Visit> visits_;
  std::vector<std::uint32_t> firstVisit_;  // by place
  std::map<PendingTimers, std::uint32_t> timerNumbers_;
  std::vector<const PendingTimers*> timers_;
  /// The first visits in situations that differ from that of the place's first visit.
  std::map<Situation, std::uint32_t> otherFirstVisits_;
  /// The further values of the parts of a look, beyond those of the first visit.
  std::map<Situation, std::vector<std::vector<LookValue>>> furtherLooks_;
  std::set<std::pair<std::uint32_t, std::uint32_t>> wholeLooks_;  // place, look; if they matter
  std::vector<std::uint8_t> edges_;        // three bytes each, in the order of the places
  std::vector<std::size_t> edgeBase_;      // where those of each 64th place begin
  std::vector<std::uint32_t> edgeOffset_;  // of each place, from there
  std::vector<bool> runsList_;
  unsigned threads_ = 1;
  std::vector<std::unique_ptr<World>> worlds_;  // one for each thread that is used
  std::optional<Workers> workers_;              // absent until several threads are used
  std::vector<std::uint32_t> targets_;          // of the visit that is being merged
  std::map<std::pair<std::uint32_t, std::uint32_t>, Occasion> timerStarts_;  // place, element
  std::vector<Arrival> starts_;
  std::uint32_t firstLook_ = 0;  // before the start
  std::size_t presses_ = 0;
  std::size_t waits_ = 0;
  ExplorationHooks hooks_;
  Stop stop_ = Stop::none;
};

/// Explores. If an end leaves a control another tag than its own, explores again with
/// `setting.tracksTaggers`, so that the element to blame is known.
std::unique_ptr<Exploration> explore(Setting& setting, const std::vector<std::string>& startKeys,
                                     const ExplorationLimits& limits, unsigned threads,
                                     const ExplorationHooks& hooks);

}  // namespace qz::tools::check
