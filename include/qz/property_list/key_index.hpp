// SPDX-License-Identifier: MIT
// A hash table of the positions of a dictionary's keys; the entries themselves are stored
// elsewhere.
//
// Keys chosen to collide do not slow it down: the hash uses a random key that differs in each run.
// (No order depends on the hash.)
#pragma once

#include <cstddef>
#include <cstdint>
#include <limits>
#include <memory_resource>
#include <string_view>
#include <vector>

#include "qz/api.hpp"
#include "qz/property_list/value.hpp"

namespace qz::toolkit {

/// Returns the hash of a string key.
QZ_API std::uint64_t hashOf(std::string_view text);
/// Returns the same hash for keys that are the same (see `sameKey`).
QZ_API std::uint64_t hashOfKey(const Value& key);

/// Whether two keys are the same. Strings are compared by text, numbers by value (a boolean equals
/// only a boolean), data by bytes, dates and UIDs by number. A collection is the same only as
/// itself.
QZ_API bool sameKey(const Value& a, const Value& b);

/// An open-addressing table of positions. It does not know the entries: the caller compares the key
/// at a position.
class QZ_API KeyIndex {
 public:
  static constexpr std::size_t none =
      std::numeric_limits<std::size_t>::max();  ///< the position of a key that is not in the index

  /// Makes an index with room for `count` keys.
  KeyIndex(std::size_t count, std::pmr::memory_resource* memory);
  /// Copies an index into other memory.
  KeyIndex(const KeyIndex& other, std::pmr::memory_resource* memory)
      : slots_(other.slots_, memory), used_(other.used_) {}

  /// Returns the position of the key with that hash for which `isKeyAt(position)` is true, or
  /// `none`.
  template <class IsKeyAt>
  std::size_t find(std::uint64_t hash, IsKeyAt isKeyAt) const {
    for (std::size_t at = home(hash); slots_[at].position != free; at = next(at)) {
      if (slots_[at].tag == tagOf(hash) && isKeyAt(std::size_t{slots_[at].position})) {
        return slots_[at].position;
      }
    }
    return none;
  }

  /// Whether `append` needs a larger index.
  bool isFull() const { return used_ >= slots_.size() / 4 * 3; }
  /// Adds a new key, whose position is one after the last. The index must not be full.
  void append(std::uint64_t hash);
  /// Removes a key; later positions move down by one. `hashAt(position)` returns the hash of the
  /// key that had this position before the removal.
  template <class HashAt>
  void remove(std::size_t position, HashAt hashAt);

 private:
  using Position = std::uint32_t;
  static constexpr Position free = std::numeric_limits<Position>::max();

  struct Slot {
    Position position = free;
    std::uint32_t tag = 0;  // other bits of the hash, so that few keys need comparing
  };

  static std::uint32_t tagOf(std::uint64_t hash) { return static_cast<std::uint32_t>(hash >> 32); }
  std::size_t home(std::uint64_t hash) const { return hash & (slots_.size() - 1); }
  std::size_t next(std::size_t at) const { return (at + 1) & (slots_.size() - 1); }

  std::pmr::vector<Slot> slots_;  // the size is a power of two; some slots are always free
  std::size_t used_ = 0;
};

template <class HashAt>
void KeyIndex::remove(std::size_t position, HashAt hashAt) {
  std::size_t gap = home(hashAt(position));
  while (slots_[gap].position != position) gap = next(gap);
  // A key that a look-up would reach only across the gap moves into the gap, which leaves a new
  // gap.
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

}  // namespace qz::toolkit
