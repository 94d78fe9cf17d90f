// SPDX-License-Identifier: MIT
// The places that were found, each once, under numbers in the order of their finding.
#pragma once

#include <cstdint>
#include <memory>
#include <optional>
#include <vector>

namespace qz::tools::check {

/// Two places are the same if all their bytes are: the hash only says where to look.
class PlaceSet {
 public:
  /// `size` is the number of bytes of a place.
  explicit PlaceSet(std::size_t size);

  static std::uint64_t hashOf(const std::uint8_t* place, std::size_t size);

  std::size_t count() const { return count_; }
  const std::uint8_t* place(std::uint32_t number) const {
    return blocks_[number >> blockShift_].get() + (number & blockMask()) * size_;
  }
  /// Have the processor fetch what `find` looks at first, and then what that names.
  void prefetchSlot(std::uint64_t hash) const { prefetch(&slots_[hash & (slots_.size() - 1)]); }
  void prefetchPlace(std::uint64_t hash) const {
    const std::uint32_t number = slots_[hash & (slots_.size() - 1)];
    if (number != noPlace) prefetch(place(number));
  }
  /// Returns the number of a place; absent if it was not added. May be called by several threads
  /// while none adds.
  std::optional<std::uint32_t> find(const std::uint8_t* place, std::uint64_t hash) const;
  /// Adds a place that is not there yet and returns its number.
  std::uint32_t add(const std::uint8_t* place, std::uint64_t hash);

 private:
  static constexpr std::uint32_t noPlace = 0xffffffff;

  static void prefetch([[maybe_unused]] const void* address) {
#if defined(__GNUC__)
    __builtin_prefetch(address);
#endif
  }

  std::uint32_t blockMask() const { return (1U << blockShift_) - 1; }
  void grow();

  std::size_t size_;
  unsigned blockShift_ = 0;  // a block has 2 to the power of this places
  std::size_t count_ = 0;
  std::vector<std::unique_ptr<std::uint8_t[]>> blocks_;
  std::vector<std::uint32_t> slots_;  // numbers of places; a power of two, at most two thirds full
};

}  // namespace qz::tools::check
