// SPDX-License-Identifier: MIT
// What presses did, so that the engine need not do the same again and again: most of the places of
// a large walk-through differ in controls that a press has nothing to do with.
#pragma once

#include <cstddef>
#include <cstdint>
#include <vector>

#include "tools/check/arrival.hpp"
#include "tools/check/facts.hpp"
#include "tools/check/place.hpp"

namespace qz::tools::check {

/// Where a move is made.
struct Departure {
  const std::uint8_t* place;
  std::uint32_t look;
  const PendingTimers& pending;
};

/// The controls that a press has looked up, and the tags that it has looked for. A press depends on
/// nothing else but the look and the pending timers, and changes no other control.
class Trace {
 public:
  void clear();
  void addControl(std::size_t control);
  void addTag(Tag tag);
  /// Whether there are so many that finding them again takes as long as the press.
  bool isLong() const { return isLong_; }

  const std::vector<std::size_t>& controls() const { return controls_; }
  const std::vector<Tag>& tags() const { return tags_; }

 private:
  std::vector<std::size_t> controls_;
  std::vector<Tag> tags_;
  bool isLong_ = false;
};

/// One press, what it depended on and what it did.
class RememberedPress {
 public:
  /// `to` is the place to which the press led.
  RememberedPress(const PlaceFormat& format, const Trace& trace, const Departure& from,
                  const std::uint8_t* to);

  /// Whether the same press does the same here.
  bool fits(const PlaceFormat& format, const Departure& from) const;
  /// Writes the place to which the press leads from `from`.
  void apply(const PlaceFormat& format, const std::uint8_t* from, std::uint8_t* to) const;

  Arrival arrival;
  PendingTimers timers;  ///< that are pending afterwards
  std::vector<Fact> facts;

 private:
  struct Change {
    std::size_t control;
    std::uint32_t before;  // codes
    std::uint32_t after;
  };
  struct Bearers {
    std::uint32_t tag;  // its number
    std::vector<std::size_t> controls;
  };

  std::uint32_t look_;
  PendingTimers pending_;
  std::vector<Change> changes_;
  std::vector<Bearers> bearers_;
};

/// The last presses of each control.
class RememberedPresses {
 public:
  explicit RememberedPresses(const PlaceFormat& format);

  /// Returns null if nothing is remembered that fits.
  const RememberedPress* find(std::size_t control, const Departure& from) const;
  void add(std::size_t control, RememberedPress press);

 private:
  struct Ring {
    std::vector<RememberedPress> presses;
    std::size_t oldest = 0;
  };

  const PlaceFormat& format_;
  std::vector<Ring> rings_;  // by control
  std::size_t count_ = 0;
};

}  // namespace qz::tools::check
