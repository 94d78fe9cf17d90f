// SPDX-License-Identifier: MIT
// Where a dictionary's keys stand among its entries: a hash table of positions, beside the entries.
//
// Keys that somebody chose to collide do not slow it down: the hash is keyed by a number that
// differs from run to run. (No order depends on it.)
#pragma once

#include <cstddef>
#include <cstdint>
#include <limits>
#include <memory_resource>
#include <string_view>
#include <vector>

#include "toolkit/property_list/value.hpp"

namespace toolkit {

std::uint64_t hashOf(std::string_view text);
/// The same for keys that are the same.
std::uint64_t hashOfKey(const Value& key);

/// Whether two keys are the same: strings by their text, numbers by what they count to (a boolean
/// is none), data by their bytes, dates and UIDs by their number. Values that hold others are the
/// same only as themselves.
bool sameKey(const Value& a, const Value& b);

/// An open-addressing table of positions. It does not see the entries: whoever looks something up
/// says how the key at a position compares.
class KeyIndex {
 public:
  static constexpr std::size_t none = std::numeric_limits<std::size_t>::max();

  /// Has room for `count` keys.
  KeyIndex(std::size_t count, std::pmr::memory_resource* memory);
  KeyIndex(const KeyIndex& other, std::pmr::memory_resource* memory)
      : slots_(other.slots_, memory), used_(other.used_) {}

  /// The position of the key with that hash for which `isKeyAt(position)` holds, or `none`.
  template <class IsKeyAt>
  std::size_t find(std::uint64_t hash, IsKeyAt isKeyAt) const {
    for (std::size_t at = home(hash); slots_[at].position != free; at = next(at)) {
      if (slots_[at].tag == tagOf(hash) && isKeyAt(std::size_t{slots_[at].position})) {
        return slots_[at].position;
      }
    }
    return none;
  }

  bool isFull() const { return used_ >= slots_.size() / 4 * 3; }
  /// Takes in a key that is not there yet, whose position is one after the last. Not when full.
  void append(std::uint64_t hash);
  /// Takes a key out; the positions after it move down by one. `hashAt(position)` is the hash of a
  /// key's, by its position before that.
  template <class HashAt>
  void remove(std::size_t position, HashAt hashAt);

 private:
  using Position = std::uint32_t;
  static constexpr Position free = std::numeric_limits<Position>::max();

  struct Slot {
    Position position = free;
    std::uint32_t tag = 0;  // other bits of the hash, so that few keys need to be looked at
  };

  static std::uint32_t tagOf(std::uint64_t hash) { return static_cast<std::uint32_t>(hash >> 32); }
  std::size_t home(std::uint64_t hash) const { return hash & (slots_.size() - 1); }
  std::size_t next(std::size_t at) const { return (at + 1) & (slots_.size() - 1); }

  std::pmr::vector<Slot> slots_;  // a power of two of them, some always free
  std::size_t used_ = 0;
};

template <class HashAt>
void KeyIndex::remove(std::size_t position, HashAt hashAt) {
  std::size_t gap = home(hashAt(position));
  while (slots_[gap].position != position) gap = next(gap);
  // A key that a look-up would reach only across the gap moves into it, which leaves the next gap.
  for (std::size_t at = next(gap); slots_[at].position != free; at = next(at)) {
    const std::size_t mask = slots_.size() - 1;
    const std::size_t wanted = home(hashAt(std::size_t{slots_[at].position}));
    if (((at - wanted) & mask) < ((at - gap) & mask)) continue;
    slots_[gap] = slots_[at];
    gap = at;
  }
  slots_[gap] = {};
  for (Slot& slot : slots_) {
    if (slot.position != free && slot.position > position) --slot.position;
  }
  --used_;
}

}  // namespace toolkit
