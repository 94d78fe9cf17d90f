// SPDX-License-Identifier: MIT
// The steps of a storyboard: every place with every look, and the moves between them.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "tools/exploration/exploration.hpp"

namespace qz::tools::storyboard {

using StepIndex = std::uint32_t;

/// What a user can do at a step.
struct BoardMove {
  check::Move move = 0;
  std::optional<StepIndex> to{};  ///< absent: it runs lists without end, or was not explored
};

/// A place with a look. After the end nothing is seen, so there is one for each list that ends.
struct BoardStep {
  std::uint32_t visit = 0;  ///< of the exploration: a shortest way to here
  std::uint32_t place = 0;
  std::uint32_t look = 0;
  std::uint32_t list = check::noList;     ///< that had the last word
  std::string group{};                    ///< the name of a source's step, else the key of `list`
  std::vector<std::uint32_t> ranLists{};  ///< by the last move of the shortest way, in order
  std::vector<BoardMove> moves{};
  bool isOver = false;
};

class Board {
 public:
  /// The exploration must have been made with whole looks, exact states and all lists watched. It
  /// must outlive the board.
  Board(check::Exploration& exploration, unsigned threads);

  const check::Exploration& exploration() const { return exploration_; }
  /// Returns the steps, nearest first.
  const std::vector<BoardStep>& steps() const { return steps_; }
  /// Returns the step after the start with each start key; absent: it runs lists without end.
  const std::vector<std::optional<StepIndex>>& starts() const { return starts_; }
  /// Returns the last step of a path; absent if the path leads nowhere.
  std::optional<StepIndex> endOf(const check::Path& path) const;
  /// Returns the steps of a path, as far as it leads somewhere.
  std::vector<StepIndex> stepsOf(const check::Path& path) const;

 private:
  std::optional<StepIndex> after(StepIndex step, const check::Step& move) const;

  check::Exploration& exploration_;
  std::vector<BoardStep> steps_;
  std::vector<std::optional<StepIndex>> starts_;
};

}  // namespace qz::tools::storyboard
