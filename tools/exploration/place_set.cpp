// SPDX-License-Identifier: MIT
#include "tools/exploration/place_set.hpp"

#include <cstring>

namespace qz::tools::check {
namespace {

constexpr std::size_t firstSlots = 1U << 10U;
constexpr std::size_t blockBytes = std::size_t{1} << 20U;
constexpr unsigned mostShift = 14;

// The multipliers of MurmurHash3's finalizer, which spread every bit over all others.
std::uint64_t mixed(std::uint64_t bits) {
  bits = (bits ^ bits >> 33U) * 0xff51afd7ed558ccdULL;
  bits = (bits ^ bits >> 33U) * 0xc4ceb9fe1a85ec53ULL;
  return bits ^ bits >> 33U;
}

}  // namespace

PlaceSet::PlaceSet(std::size_t size) : size_(size), slots_(firstSlots, noPlace) {
  while (blockShift_ < mostShift && size << (blockShift_ + 1) <= blockBytes) ++blockShift_;
}

std::uint64_t PlaceSet::hashOf(const std::uint8_t* place, std::size_t size) {
  std::uint64_t hash = size;
  for (; size >= sizeof hash; place += sizeof hash, size -= sizeof hash) {
    std::uint64_t word = 0;
    std::memcpy(&word, place, sizeof word);
    hash = mixed(hash ^ word);
  }
  std::uint64_t rest = 0;
  std::memcpy(&rest, place, size);
  return mixed(hash ^ rest);
}

std::optional<std::uint32_t> PlaceSet::find(const std::uint8_t* place, std::uint64_t hash) const {
  const std::size_t mask = slots_.size() - 1;
  for (std::size_t slot = hash & mask; slots_[slot] != noPlace; slot = (slot + 1) & mask) {
    if (std::memcmp(this->place(slots_[slot]), place, size_) == 0) return slots_[slot];
  }
  return std::nullopt;
}

std::uint32_t PlaceSet::add(const std::uint8_t* place, std::uint64_t hash) {
  if ((count_ + 1) * 3 > slots_.size() * 2) grow();
  const auto number = static_cast<std::uint32_t>(count_++);
  if ((number & blockMask()) == 0) blocks_.emplace_back(new std::uint8_t[size_ << blockShift_]);
  std::memcpy(blocks_.back().get() + (number & blockMask()) * size_, place, size_);
  const std::size_t mask = slots_.size() - 1;
  std::size_t slot = hash & mask;
  while (slots_[slot] != noPlace) slot = (slot + 1) & mask;
  slots_[slot] = number;
  return number;
}

void PlaceSet::grow() {
  std::vector<std::uint32_t> wider(slots_.size() * 2, noPlace);
  const std::size_t mask = wider.size() - 1;
  for (std::uint32_t number = 0; number < count_; ++number) {
    std::size_t slot = hashOf(place(number), size_) & mask;
    while (wider[slot] != noPlace) slot = (slot + 1) & mask;
    wider[slot] = number;
  }
  slots_ = std::move(wider);
}

}  // namespace qz::tools::check
