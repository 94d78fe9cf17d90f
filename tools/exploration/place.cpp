// SPDX-License-Identifier: MIT
#include "tools/exploration/place.hpp"

#include <algorithm>
#include <cstring>

namespace qz::tools::check {
namespace {

constexpr std::uint32_t hiddenBit = 1;
constexpr std::uint32_t disabledBit = 2;
constexpr std::uint32_t tagFactor = 4;

std::size_t bytesFor(std::size_t codes) {
  if (codes <= std::size_t{1} << 8U) return 1;
  return codes <= std::size_t{1} << 16U ? 2 : 4;
}

}  // namespace

PlaceFormat::PlaceFormat(std::size_t controls, std::vector<Tag> tags)
    : controls_(controls), tags_(std::move(tags)) {
  std::sort(tags_.begin(), tags_.end());
  tags_.erase(std::unique(tags_.begin(), tags_.end()), tags_.end());
  width_ = bytesFor(tags_.size() * tagFactor);
  for (std::size_t i = 0; i < tags_.size(); ++i) {
    numbers_.emplace(tags_[i], static_cast<std::uint32_t>(i));
  }
}

std::uint32_t PlaceFormat::code(const std::uint8_t* place, std::size_t index) const {
  std::uint32_t code = 0;
  for (std::size_t i = width_; i-- > 0;) code = code << 8U | place[index * width_ + i];
  return code;
}

ControlState PlaceFormat::control(const std::uint8_t* place, std::size_t index) const {
  const std::uint32_t bits = code(place, index);
  return {.tag = tags_[bits / tagFactor],
          .hidden = (bits & hiddenBit) != 0,
          .enabled = (bits & disabledBit) == 0};
}

void PlaceFormat::setControl(std::uint8_t* place, std::size_t index,
                             const ControlState& state) const {
  setCode(place, index,
          numbers_.at(state.tag) * tagFactor + (state.hidden ? hiddenBit : 0) +
              (state.enabled ? 0 : disabledBit));
}

void PlaceFormat::setCode(std::uint8_t* place, std::size_t index, std::uint32_t code) const {
  for (std::size_t i = 0; i < width_; ++i, code >>= 8U) {
    place[index * width_ + i] = static_cast<std::uint8_t>(code);
  }
}

std::optional<std::uint32_t> PlaceFormat::numberOf(Tag tag) const {
  const auto number = numbers_.find(tag);
  return number == numbers_.end() ? std::nullopt : std::optional(number->second);
}

bool PlaceFormat::hasTag(const std::uint8_t* place, std::size_t index,
                         std::uint32_t tagNumber) const {
  return code(place, index) / tagFactor == tagNumber;
}

std::size_t PlaceFormat::controlsWithTag(const std::uint8_t* place, std::uint32_t tagNumber) const {
  std::size_t count = 0;
  if (width_ > 1) {
    for (std::size_t i = 0; i < controls_; ++i) count += hasTag(place, i, tagNumber);
    return count;
  }
  // Counted in bytes, which a compiler adds many at a time.
  constexpr std::size_t portion = 255;
  constexpr std::uint8_t tagBits = 0xff - hiddenBit - disabledBit;
  const auto wanted = static_cast<std::uint8_t>(tagNumber * tagFactor);
  for (std::size_t i = 0; i < controls_;) {
    std::uint8_t found = 0;
    for (const std::size_t end = std::min(i + portion, controls_); i < end; ++i) {
      found = static_cast<std::uint8_t>(found + ((place[i] & tagBits) == wanted));
    }
    count += found;
  }
  return count;
}

bool PlaceFormat::differs(const std::uint8_t* a, const std::uint8_t* b, std::size_t index) const {
  return std::memcmp(a + index * width_, b + index * width_, width_) != 0;
}

std::uint32_t PlaceFormat::timers(const std::uint8_t* place) const {
  std::uint32_t timers = 0;
  std::memcpy(&timers, place + controls_ * width_, sizeof timers);
  return timers;
}

void PlaceFormat::setTimers(std::uint8_t* place, std::uint32_t timers) const {
  std::memcpy(place + controls_ * width_, &timers, sizeof timers);
}

}  // namespace qz::tools::check
