// SPDX-License-Identifier: MIT
#include "tools/check/remembered_presses.hpp"

#include <algorithm>
#include <utility>

namespace qz::tools::check {
namespace {

constexpr std::size_t longestTrace = 32;
constexpr std::size_t pressesOfAControl = 16;
constexpr std::size_t mostPresses = 20'000;  // some 10 MB

/// Returns NO if that would make the trace too long.
template <class Each>
bool addOnce(std::vector<Each>& all, Each one) {
  if (std::find(all.begin(), all.end(), one) != all.end()) return true;
  if (all.size() == longestTrace) return false;
  all.push_back(one);
  return true;
}

}  // namespace

void Trace::clear() {
  controls_.clear();
  tags_.clear();
  isLong_ = false;
}

void Trace::addControl(std::size_t control) { isLong_ = isLong_ || !addOnce(controls_, control); }

void Trace::addTag(Tag tag) { isLong_ = isLong_ || !addOnce(tags_, tag); }

RememberedPress::RememberedPress(const PlaceFormat& format, const Trace& trace,
                                 const Departure& from, const std::uint8_t* to)
    : look_(from.look), pending_(from.pending) {
  for (const std::size_t control : trace.controls()) {
    changes_.push_back({control, format.code(from.place, control), format.code(to, control)});
  }
  for (const Tag tag : trace.tags()) {
    const auto number = format.numberOf(tag);
    if (!number) continue;  // no control has the tag in any place
    Bearers bearers{*number, {}};
    for (std::size_t i = 0; i < format.controls(); ++i) {
      if (format.hasTag(from.place, i, *number)) bearers.controls.push_back(i);
    }
    bearers_.push_back(std::move(bearers));
  }
}

bool RememberedPress::fits(const PlaceFormat& format, const Departure& from) const {
  return look_ == from.look && pending_ == from.pending &&
         std::all_of(changes_.begin(), changes_.end(),
                     [&](const Change& each) {
                       return format.code(from.place, each.control) == each.before;
                     }) &&
         std::all_of(bearers_.begin(), bearers_.end(), [&](const Bearers& each) {
           return std::all_of(each.controls.begin(), each.controls.end(),
                              [&](std::size_t control) {
                                return format.hasTag(from.place, control, each.tag);
                              }) &&
                  format.controlsWithTag(from.place, each.tag) == each.controls.size();
         });
}

void RememberedPress::apply(const PlaceFormat& format, const std::uint8_t* from,
                            std::uint8_t* to) const {
  std::copy(from, from + format.size(), to);
  for (const Change& change : changes_) format.setCode(to, change.control, change.after);
}

RememberedPresses::RememberedPresses(const PlaceFormat& format)
    : format_(format), rings_(format.controls()) {}

const RememberedPress* RememberedPresses::find(std::size_t control, const Departure& from) const {
  const auto& presses = rings_[control].presses;
  const auto found = std::find_if(presses.begin(), presses.end(),
                                  [&](const auto& each) { return each.fits(format_, from); });
  return found == presses.end() ? nullptr : &*found;
}

void RememberedPresses::add(std::size_t control, RememberedPress press) {
  Ring& ring = rings_[control];
  if (ring.presses.size() < pressesOfAControl && count_ < mostPresses) {
    ring.presses.push_back(std::move(press));
    ++count_;
    return;
  }
  if (ring.presses.empty()) return;
  ring.presses[ring.oldest] = std::move(press);
  ring.oldest = (ring.oldest + 1) % ring.presses.size();
}

}  // namespace qz::tools::check
