// SPDX-License-Identifier: MIT
// Places: all that what happens next in a walk-through can depend on, in few bytes.
#pragma once

#include <compare>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <unordered_map>
#include <vector>

#include "qz/toolkit/tag.hpp"

namespace qz::tools::check {

using toolkit::Tag;

/// What a place holds of one control.
struct ControlState {
  Tag tag = 0;
  bool hidden = false;
  bool enabled = true;
  friend bool operator==(const ControlState&, const ControlState&) = default;
};

/// A pending timer: the key of its list, and the time until it fires.
struct PendingTimer {
  std::string key;
  double seconds = 0;
  friend auto operator<=>(const PendingTimer&, const PendingTimer&) = default;
};

/// The pending timers, in the order of their firing.
using PendingTimers = std::vector<PendingTimer>;

/// Packs places into bytes and unpacks them. A place has a fixed number of bytes: a code for each
/// control, then the number of its pending timers' combination, then whether the walk-through is
/// over. Equal places have equal bytes.
class PlaceFormat {
 public:
  /// `tags` are all tags that the controls can have, in any order.
  PlaceFormat(std::size_t controls, std::vector<Tag> tags);

  std::size_t controls() const { return controls_; }
  /// Returns the size of a place.
  std::size_t size() const { return controls_ * width_ + sizeof(std::uint32_t) + 1; }

  ControlState control(const std::uint8_t* place, std::size_t index) const;
  void setControl(std::uint8_t* place, std::size_t index, const ControlState& state) const;
  /// Whether two places differ in a control.
  bool differs(const std::uint8_t* a, const std::uint8_t* b, std::size_t index) const;

  /// A control's code: equal in two places if and only if the control's states are.
  std::uint32_t code(const std::uint8_t* place, std::size_t index) const;
  void setCode(std::uint8_t* place, std::size_t index, std::uint32_t code) const;
  /// Returns the number of a tag, which codes have; absent if no control can have the tag.
  std::optional<std::uint32_t> numberOf(Tag tag) const;
  bool hasTag(const std::uint8_t* place, std::size_t index, std::uint32_t tagNumber) const;
  /// Returns how many controls have the tag with this number.
  std::size_t controlsWithTag(const std::uint8_t* place, std::uint32_t tagNumber) const;

  std::uint32_t timers(const std::uint8_t* place) const;
  void setTimers(std::uint8_t* place, std::uint32_t timers) const;
  bool isOver(const std::uint8_t* place) const { return place[size() - 1] != 0; }
  void setOver(std::uint8_t* place, bool over) const { place[size() - 1] = over ? 1 : 0; }

 private:
  std::size_t controls_;
  std::size_t width_;  // bytes of a control's code
  std::vector<Tag> tags_;
  std::unordered_map<Tag, std::uint32_t> numbers_;  // of the tags
};

}  // namespace qz::tools::check
