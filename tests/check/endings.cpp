// SPDX-License-Identifier: MIT
// What a walk-through leaves behind.
#include "tests/check/endings.hpp"

namespace qz::naive {

Endings::Endings(const Script& script, const HostWindow& host, const std::string& resources) {
  const World world(script, host, resources);
  before_ = world.pictures();
  for (std::size_t i = 0; i < before_.size(); ++i) {
    looksBefore_.push_back(world.lookOf(before_[i], i, numbers_));
  }
  left_.resize(before_.size());
}

void Endings::note(const World& world, std::size_t pathLength) {
  const Controls now = world.pictures();
  for (std::size_t i = 0; i < now.size(); ++i) {
    const toolkit::Tag own = before_[i].tag;
    if (now[i].tag != own) {
      const auto& by = world.history().taggedBy[i];
      const auto element = by ? std::optional(by->element) : std::nullopt;
      tags_.add({"tag-left", by ? by->list : "", element, own, pathLength});
    }
    if (isChanged(world, now[i], i)) {
      left_[i].add({"left-behind", world.history().endList, std::nullopt, own, pathLength});
    }
  }
}

// A state that the user changed last is the user's business.
bool Endings::isChanged(const World& world, const drivers::ViewPicture& control,
                        std::size_t index) {
  const auto& before = before_[index];
  if (control.hidden != before.hidden || control.enabled != before.enabled) return true;
  ControlLook look = world.lookOf(control, index, numbers_);
  if (look.back() == userState) look.back() = looksBefore_[index].back();
  return look != looksBefore_[index];
}

void Endings::report(Findings& findings) const {
  for (const Finding& finding : tags_.all()) findings.add(finding);
  for (const Findings& control : left_) {
    for (const Finding& finding : control.all()) findings.addAnother(finding);
  }
}

}  // namespace qz::naive
