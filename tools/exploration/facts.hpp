// SPDX-License-Identifier: MIT
// Facts: what was seen while a script was played, from which the findings follow.
#pragma once

#include <cstddef>
#include <cstdint>
#include <map>
#include <string>
#include <unordered_map>
#include <utility>
#include <vector>

#include "tools/exploration/move.hpp"

namespace qz::tools::check {

enum class FactKind : std::uint8_t {
  // of an element of a list
  elementRan,
  elementRaised,
  targetFound,
  targetMissed,
  targetSuited,
  targetUnsuited,
  flashAccepted,
  flashRefused,
  timerStarted,
  timerFires,     ///< the timer that the element started is the first to fire after a move
  timerBeaten,    ///< another timer replaced it, or fires before it
  sharedTagUsed,  ///< two controls had the tag that it names
  endlessChain,   ///< it runs a list that is running already; detail: the loop
  // of a list
  listRan,
  // of a tag
  noListPressed,    ///< a button with the tag can be pressed, and no list is under the tag
  sharedTagPressed  ///< a button is pressed while another control has its tag
};

inline constexpr std::size_t factKinds = static_cast<std::size_t>(FactKind::sharedTagPressed) + 1;

/// What a fact is about: the number of an element, the index of a list, or a tag.
using Subject = std::int64_t;

struct Fact {
  FactKind kind = FactKind::elementRan;
  Subject subject = 0;
  std::string detail;  ///< the reason of an exception, a loop, a kind of control; or empty
};

/// A move out of a visit. Visits have numbers in the order in which they were found, so an earlier
/// occasion has no longer path.
struct Occasion {
  std::uint32_t visit = 0;
  Move move = 0;
};

inline constexpr std::uint32_t noPlace = 0xffffffff;

/// The facts, each with its first occasion and the number of places that show it.
class FactTable {
 public:
  struct Entry {
    Occasion first;
    std::string detail;
    std::size_t places = 0;
    bool isPlace = false;  ///< the place before the move shows it already
    std::uint32_t lastPlace = noPlace;
  };

  bool has(FactKind kind, Subject subject) const { return find(kind, subject) != nullptr; }
  /// Returns null if the fact was never seen.
  const Entry* find(FactKind kind, Subject subject) const;
  /// Returns the facts of a kind, by subject.
  const std::map<Subject, Entry>& all(FactKind kind) const {
    return entries_[static_cast<std::size_t>(kind)];
  }
  /// Adds a fact that was seen on a move out of `place`, or of a place that was counted before
  /// (`noPlace`). Facts must be added in the order of their occasions.
  void add(const Fact& fact, Occasion occasion, std::uint32_t place);

 private:
  std::map<Subject, Entry> entries_[factKinds];
};

}  // namespace qz::tools::check
