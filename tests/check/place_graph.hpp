// SPDX-License-Identifier: MIT
// The places of a walk-through and the moves between them, and what is wrong with where they lead.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

#include "tests/check/finding.hpp"
#include "tests/check/move.hpp"
#include "tests/check/trace.hpp"

namespace qz::naive {

/// What a move leads to, and what is blamed for it: the list that it started, or the button without
/// a list that was pressed.
struct Step {
  std::optional<std::size_t> to;  ///< index of a place; absent: unknown, or an endless chain
  bool isUnknown = false;         ///< a limit kept the place out
  bool runsList = false;
  std::string list;
  std::optional<toolkit::Tag> tag;
};

struct Place {
  std::string text;
  std::size_t pathLength = 0;  ///< of the shortest path
  bool hasEnded = false;
  std::vector<Move> moves;
  std::vector<Step> steps;  ///< one a move
  Step arrival;             ///< the last step of the shortest path
};

/// Returns what a move with this trace is blamed as; the caller adds where it leads.
Step stepOf(const Move& move, const Trace& trace);

class PlaceGraph {
 public:
  std::vector<Place> places;
  std::vector<Step> starts;

  /// Adds dead ends, traps, and the lack of an end. Says nothing of places whose moves are not all
  /// known.
  void report(bool complete, Findings& findings) const;

 private:
  using Marks = std::vector<bool>;

  template <class Goes>
  Marks reaching(Marks marks, Goes goes) const;
  Marks canRunLists() const;
  Marks canEnd() const;
  Marks reachableFrom(std::size_t place) const;
  bool isClosed(std::size_t place) const;
  void reportDeadEnds(const Marks& lively, Findings& findings) const;
  void reportDeadStep(const Step& step, std::size_t pathLength, const Marks& lively,
                      Findings& findings) const;
  void reportTraps(const Marks& lively, Findings& findings) const;
  void reportTrap(const Marks& members, Findings& findings) const;
};

}  // namespace qz::naive
