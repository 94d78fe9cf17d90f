// SPDX-License-Identifier: MIT
// The meaning of walk-throughs in steps: what docs/steps.md says, and nothing else.
#pragma once

#include <compare>
#include <cstddef>
#include <map>
#include <optional>
#include <string>
#include <vector>

#include "tests/steps/reading.hpp"
#include "tests/steps/written_tour.hpp"

namespace qz::meaning {

/// Where a user is. States that are equal look and go on the same.
struct State {
  std::string step{};
  std::vector<std::string> way{};       ///< steps to go back to; the last one comes first
  std::vector<toolkit::State> boxes{};  ///< of each control of the window
  bool waits = false;                   ///< the step's wait is pending; it has begun right now
  bool isOver = false;

  friend auto operator<=>(const State&, const State&) = default;
};

/// What a control looks like.
struct ControlLook {
  Reading reading{};                  ///< text, title, or name of the image
  std::optional<std::string> font{};  ///< absent: the control's own
  bool isCentered = false;
  std::string toolTip{};
  std::string color{};  ///< of a title; empty: the control's own
  bool isRed = false;
  toolkit::State state = toolkit::State::off;
  bool isShown = true;
  bool isEnabled = true;
  bool isFlashing = false;

  friend bool operator==(const ControlLook&, const ControlLook&) = default;
};

/// What the window looks like.
struct Look {
  std::vector<ControlLook> controls{};
  std::string background{};  ///< the image behind the controls; empty: none

  friend bool operator==(const Look&, const Look&) = default;
};

class Interpreter {
 public:
  explicit Interpreter(const Tour& tour);

  State start() const { return startAt(tour_.steps.front().first); }
  /// Returns the state after a start at the step.
  State startAt(const std::string& step) const;
  /// Returns the state after a press of the control, which the user must be able to press.
  State press(State state, std::size_t control) const;
  /// Returns the state after the pending wait.
  State waitOver(const State& state) const { return go(state, waitOf(state)->go); }

  Look look(const State& state) const;
  /// Returns the controls that the user can press.
  std::vector<std::size_t> pressable(const State& state) const;
  /// Returns the wait of the step, pending or not; absent if it has none, or if that leads nowhere.
  std::optional<Wait> waitOf(const State& state) const;
  /// Whether the step has a wait at all.
  bool hasWait(const std::string& step) const { return steps_.at(step).wait.has_value(); }
  /// Returns the press of the control at the step; absent if nothing says it.
  std::optional<std::string> pressOf(const std::string& step, std::size_t control) const;

 private:
  bool leadsNowhere(const State& state, const std::string& target) const;
  State go(State state, const std::string& said) const;
  State enter(State state, const std::string& step) const;
  Words said(const Part& part, std::size_t control) const;
  Words wordsOf(const std::string& step, std::size_t control) const;
  bool isShown(const std::string& step, std::size_t control) const;
  bool isEnabled(const State& state, std::size_t control) const;
  ControlLook lookOf(const State& state, std::size_t control) const;

  const Tour tour_;
  const Part everyStep_;
  std::map<std::string, Part> own_{};    // what each step says itself
  std::map<std::string, Part> steps_{};  // what it does not say, `every step` says
};

}  // namespace qz::meaning
