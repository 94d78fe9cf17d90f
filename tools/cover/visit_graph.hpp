// SPDX-License-Identifier: MIT
// The visits of an exploration and the moves between them, with what each move is good for in a
// test.
#pragma once

#include <compare>
#include <cstdint>
#include <optional>
#include <set>
#include <vector>

#include "tools/exploration/exploration.hpp"

namespace qz::tools::cover {

/// What a user sees, and the list that had the last word. The number of the appearance is the same
/// for all that looks the same to a user; states that the user changed do not count.
struct SeenStep {
  std::uint32_t list = check::noList;
  std::uint32_t appearance = 0;

  auto operator<=>(const SeenStep&) const = default;
};

/// What some scenario must do: make a move from one step to another, or run a list. Where a step is
/// at several places, such as with other tags, its moves are made at each.
struct Goal {
  SeenStep from{};
  std::uint32_t place = check::noPlace;
  check::Move move = 0;
  SeenStep to{};
  std::uint32_t ranList = check::noList;  ///< or this, and all else is 0

  auto operator<=>(const Goal&) const = default;
};

/// A move out of a visit, or the start.
struct Way {
  check::Occasion occasion{};
  std::uint32_t to = 0;  ///< the visit to which it leads
  std::vector<Goal> goals{};
};

class VisitGraph {
 public:
  /// The exploration must have been made with `Setting::wholeLooks` and with all lists watched.
  VisitGraph(check::Exploration& exploration, unsigned threads);

  const std::vector<Way>& starts() const { return starts_; }
  const std::vector<Way>& waysFrom(std::uint32_t visit) const { return ways_[visit]; }
  std::size_t visits() const { return ways_.size(); }
  /// Returns all goals of all ways.
  std::set<Goal> goals() const;

 private:
  std::vector<Way> starts_;
  std::vector<std::vector<Way>> ways_;
};

}  // namespace qz::tools::cover
