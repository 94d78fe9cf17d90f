// SPDX-License-Identifier: MIT
// What one move of a walk-through did, as far as findings depend on it.
#pragma once

#include <compare>
#include <cstddef>
#include <map>
#include <optional>
#include <set>
#include <string>
#include <vector>

#include "qz/commands.hpp"
#include "qz/drivers/view_kinds.hpp"
#include "qz/toolkit/tag.hpp"

namespace qz::naive {

/// An element of a list, counted from 0.
struct Site {
  std::string list;
  std::size_t element = 0;

  friend auto operator<=>(const Site&, const Site&) = default;
};

/// A timer of a tag key, by the element that started it.
struct TimerStart {
  Site site;
  std::string key;

  friend auto operator<=>(const TimerStart&, const TimerStart&) = default;
};

/// A text that a timer replaced before anybody could read it, by the element that started the
/// timer.
struct BriefText {
  Site site;
  toolkit::Tag tag = 0;  ///< of the text field

  friend auto operator<=>(const BriefText&, const BriefText&) = default;
};

/// One run of one element.
struct CommandRun {
  Site site;
  const Command* command = nullptr;    ///< null if the element is no command
  std::optional<toolkit::Tag> tag{};   ///< of the control that the command names
  bool tagIsShared = false;            ///< several controls have that tag when the command begins
  bool sought = false;                 ///< a control with the tag was looked up
  std::optional<std::size_t> found{};  ///< the control that was found, by its index in the window
  bool raised = false;
  bool raisesBySight = false;  ///< reading the script alone says that the element raises
  bool result = false;         ///< NO as well if the command raised
};

struct Trace {
  std::vector<std::string> lists;  ///< the keys of the lists that ran, in the order of their start
  std::vector<CommandRun> commands;
  std::vector<toolkit::Tag> sharedPresses;  ///< pressed tags that several controls had
  std::set<TimerStart> started;             ///< without those that last for ever
  std::set<TimerStart> fired;
  std::set<TimerStart> beaten;  ///< replaced under their key, or another timer fired first
  std::set<BriefText> brief;
  std::optional<Site> endless;  ///< the element that ran a list inside itself; then the move stops
};

/// What earlier moves did that places do not show.
struct History {
  std::string lastWord;  ///< the key of the list whose command ran last; empty before the first
  std::string endList;   ///< the key of the list that ended the walk-through; empty until then
  std::vector<bool> userState;                    ///< by control: the user changed its state last
  std::vector<double> textAge;                    ///< by control: see `ReadingTimes`
  std::vector<std::optional<Site>> taggedBy;      ///< by control: what gave it the tag that it has
  std::map<std::string, TimerStart> starters;     ///< the pending timers, by their tag keys
  std::map<std::string, std::size_t> startOrder;  ///< when each was started, in ascending numbers
};

}  // namespace qz::naive
