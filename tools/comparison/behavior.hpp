// SPDX-License-Identifier: MIT
// All that a user can see and do in a walk-through, without the tags and lists that bring it about.
#pragma once

#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <vector>

#include "tools/exploration/exploration.hpp"

namespace qz::tools::comparison {

using check::LookValue;
using check::Move;

using SituationIndex = std::uint32_t;

/// What a user sees of a control. Two hidden controls look the same.
struct Appearance {
  bool isShown = false;
  bool isEnabled = false;
  bool flashes = false;
  LookValue look = 0;  ///< in the table of the behaviour
  friend auto operator<=>(const Appearance&, const Appearance&) = default;
};

/// A moment in which the walk-through waits for the user or for a timer.
struct Situation {
  std::vector<Appearance> controls{};  ///< back to front
  LookValue background = 0;
  bool isOver = false;
  std::optional<double> wait{};  ///< seconds until the first timer fires
  /// Where each move leads that is possible; absent: it runs lists without end.
  std::map<Move, std::optional<SituationIndex>> moves{};
  std::uint32_t visit = 0;  ///< one of the exploration
};

/// A script to be explored, with all that it is played on.
struct Played {
  toolkit::ValueRef<toolkit::Dictionary> script{};
  walkthrough::StagePlan plan{};
  std::string resources{};               ///< the directory of the images
  std::vector<std::string> startKeys{};  ///< at least one
};

class Behavior {
 public:
  /// Explores. `looks` is the table of what controls look like, and must outlive the behaviour.
  /// Behaviours are compared that share a table.
  Behavior(Played played, check::Looks& looks, const check::ExplorationLimits& limits,
           unsigned threads, const check::ExplorationHooks& hooks);
  Behavior(const Behavior&) = delete;
  Behavior& operator=(const Behavior&) = delete;

  /// Whether that is everything. If not, some situations have no moves.
  bool isComplete() const { return exploration_.isComplete(); }
  const check::Exploration& exploration() const { return exploration_; }
  const check::Looks& looks() const { return looks_; }
  const std::vector<Situation>& situations() const { return situations_; }
  /// Returns the situation after the start with each start key; absent: it runs lists without end.
  const std::vector<std::optional<SituationIndex>>& starts() const { return starts_; }

 private:
  class Maker;

  Played played_;
  check::Script script_;
  check::Setting setting_;
  check::Exploration exploration_;
  check::Looks& looks_;
  std::vector<Situation> situations_;
  std::vector<std::optional<SituationIndex>> starts_;
};

}  // namespace qz::tools::comparison
