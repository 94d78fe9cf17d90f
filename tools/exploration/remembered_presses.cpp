// SPDX-License-Identifier: MIT
#include "tools/exploration/remembered_presses.hpp"

#include <algorithm>
#include <utility>

namespace qz::tools::check {
namespace {

constexpr std::size_t longestTrace = 32;
constexpr std::size_t pressesOfARing = 64;
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
  tagged_.clear();
  isLong_ = false;
}

void Trace::addControl(std::size_t control) { isLong_ = isLong_ || !addOnce(controls_, control); }

void Trace::addTag(Tag tag) { isLong_ = isLong_ || !addOnce(tags_, tag); }

void Trace::addTagged(std::size_t control) { isLong_ = isLong_ || !addOnce(tagged_, control); }

std::optional<std::size_t> PressContext::taggerPart(const Looks::Parts& parts,
                                                    std::size_t control) const {
  const std::size_t first = format.controls() + notes;
  return first < parts.size() ? std::optional(first + control) : std::nullopt;
}

RememberedPress::RememberedPress(const PressContext& context, const Trace& trace,
                                 const Station& from, const Station& to)
    : look_(from.look), ends_(context.format.isOver(to.place)) {
  const PlaceFormat& format = context.format;
  for (const std::size_t control : trace.controls()) {
    changes_.push_back({control, format.code(from.place, control), format.code(to.place, control)});
    addLookChange(control, from, to);
  }
  for (const std::size_t control : trace.tagged()) {
    const auto part = context.taggerPart(from.parts, control);
    if (part) newTaggers_.push_back({*part, to.parts[*part]});
  }
  for (std::size_t i = 0; i < context.notes; ++i) addLookChange(format.controls() + i, from, to);
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

void RememberedPress::addLookChange(std::size_t part, const Station& from, const Station& to) {
  lookChanges_.push_back({part, from.parts[part], to.parts[part]});
  changesLook_ = changesLook_ || from.parts[part] != to.parts[part];
}

bool RememberedPress::fits(const PressContext& context, const Station& from) const {
  const PlaceFormat& format = context.format;
  return std::all_of(changes_.begin(), changes_.end(),
                     [&](const Change& each) {
                       return format.code(from.place, each.control) == each.before;
                     }) &&
         (look_ == from.look || std::all_of(lookChanges_.begin(), lookChanges_.end(),
                                            [&](const LookChange& each) {
                                              return from.parts[each.part] == each.before;
                                            })) &&
         std::all_of(bearers_.begin(), bearers_.end(), [&](const Bearers& each) {
           return std::all_of(each.controls.begin(), each.controls.end(),
                              [&](std::size_t control) {
                                return format.hasTag(from.place, control, each.tag);
                              }) &&
                  format.controlsWithTag(from.place, each.tag) == each.controls.size();
         });
}

void RememberedPress::writePlace(const PressContext& context, const Station& from,
                                 std::uint8_t* to) const {
  const PlaceFormat& format = context.format;
  std::copy(from.place, from.place + format.size(), to);
  if (ends_) {
    for (std::size_t i = 0; i < format.controls(); ++i) {
      ControlState state = format.control(from.place, i);
      state.tag = context.restoredTags[i].value_or(state.tag);
      format.setControl(to, i, state);
    }
    format.setOver(to, true);
  }
  for (const Change& change : changes_) format.setCode(to, change.control, change.after);
}

std::uint32_t RememberedPress::lookAfter(const PressContext& context, const Station& from,
                                         Looks& looks) const {
  const bool restoresTaggers = ends_ && context.taggerPart(from.parts, 0);
  if (!restoresTaggers && from.look == look_) return arrival.look;
  if (!restoresTaggers && !changesLook_ && newTaggers_.empty()) return from.look;
  Looks::Parts parts = from.parts;
  for (std::size_t i = 0; restoresTaggers && i < context.format.controls(); ++i) {
    const Tag tag = context.format.control(from.place, i).tag;
    if (context.restoredTags[i].value_or(tag) != tag) parts[*context.taggerPart(parts, i)] = 0;
  }
  for (const LookChange& change : lookChanges_) parts[change.part] = change.after;
  for (const NewTagger& tagger : newTaggers_) parts[tagger.part] = tagger.value;
  return looks.numberOf(parts);
}

std::size_t RememberedPresses::Hash::operator()(const Pressed& pressed) const {
  std::uint64_t bits = pressed.control;
  for (const std::uint32_t each : {pressed.code, pressed.look}) {
    bits = (bits ^ bits >> 32U) * 0x9e3779b97f4a7c15U + each;  // 2^64 by the golden ratio
  }
  return bits;
}

RememberedPresses::Pressed RememberedPresses::pressedAt(std::size_t control,
                                                        const Station& from) const {
  return {.control = control,
          .code = context_.format.code(from.place, control),
          .look = from.parts[control]};
}

const RememberedPress* RememberedPresses::find(std::size_t control, const Station& from) const {
  const auto ring = rings_.find(pressedAt(control, from));
  if (ring == rings_.end()) return nullptr;
  const auto& presses = ring->second.presses;
  const auto found = std::find_if(presses.begin(), presses.end(),
                                  [&](const auto& each) { return each.fits(context_, from); });
  return found == presses.end() ? nullptr : &*found;
}

void RememberedPresses::add(std::size_t control, const Station& from, RememberedPress press) {
  if (count_ == mostPresses) {
    rings_.clear();
    count_ = 0;
  }
  Ring& ring = rings_[pressedAt(control, from)];
  if (ring.presses.size() < pressesOfARing) {
    ring.presses.push_back(std::move(press));
    ++count_;
    return;
  }
  ring.presses[ring.oldest] = std::move(press);
  ring.oldest = (ring.oldest + 1) % ring.presses.size();
}

}  // namespace qz::tools::check
