// SPDX-License-Identifier: MIT
#include "tools/check/look_differences.hpp"

#include <algorithm>
#include <string>

#include "tools/check/look_words.hpp"

namespace qz::tools::check {

LookComparison::LookComparison(const Exploration& exploration)
    : exploration_(exploration), flashing_(exploration) {}

void LookComparison::see(std::uint32_t place, std::uint32_t list, std::uint32_t look,
                         const Occasion& occasion) {
  const auto& format = exploration_.format();
  const std::uint8_t* const bytes = exploration_.place(place);
  if (format.isOver(bytes)) return;
  const Looks::Parts& parts = exploration_.looks().parts(look);
  for (const std::size_t control : controlsWithSeveralLooks(place)) {
    if (format.control(bytes, control).hidden) continue;
    seeControl(place, list, control,
               {{parts[control], flashing_.flashes(place, control, parts)}, occasion});
  }
}

std::vector<LookDifference> LookComparison::differences() const {
  std::vector<LookDifference> found;
  for (const auto& [cause, difference] : differences_) found.push_back(difference);
  return found;
}

std::vector<std::size_t> LookComparison::controlsWithSeveralLooks(std::uint32_t place) const {
  const auto& format = exploration_.format();
  const auto several = exploration_.partsWithSeveralLooks(place);
  const auto isOneOfThem = [&](std::size_t part) {
    return std::binary_search(several.begin(), several.end(), part);
  };
  std::vector<std::size_t> controls;
  if (several.empty()) return controls;
  for (std::size_t control = 0; control < format.controls(); ++control) {
    const auto flashPart = flashing_.partOf(place, control);
    if (isOneOfThem(control) || (flashPart && isOneOfThem(*flashPart))) controls.push_back(control);
  }
  return controls;
}

// A state that the user made does not count.
bool LookComparison::differ(const Appearance& one, const Appearance& other) const {
  if (one.flashes != other.flashes) return true;
  if (one.value == other.value) return false;
  Looks& looks = exploration_.looks();
  const ViewLook& a = looks.look(one.value);
  const ViewLook& b = looks.look(other.value);
  if (!a.hasUsersState && !b.hasUsersState) return true;
  return looks.valueOf({a.view, true}) != looks.valueOf({b.view, true});
}

std::string LookComparison::wordsFor(const Appearance& one, const Appearance& other) const {
  const Looks& looks = exploration_.looks();
  const auto words = check::wordsFor(looks.look(one.value).view, looks.look(other.value).view);
  return words.empty() ? "itself flashing or not" : words.front().either;
}

void LookComparison::seeControl(std::uint32_t place, std::uint32_t list, std::size_t control,
                                const Seen& seen) {
  auto& all = seen_[{place, list, control}];
  for (const Seen& before : all) {
    if (before.appearance == seen.appearance) return;
  }
  const auto other = std::find_if(all.begin(), all.end(), [&](const Seen& before) {
    return differ(before.appearance, seen.appearance);
  });
  if (other != all.end()) {
    add(place, {.list = list,
                .control = control,
                .first = other->occasion,
                .second = seen.occasion,
                .words = wordsFor(other->appearance, seen.appearance)});
  }
  all.push_back(seen);
}

void LookComparison::add(std::uint32_t place, const LookDifference& difference) {
  const Cause cause{difference.list, difference.control};
  LookDifference& known = differences_.try_emplace(cause, difference).first->second;
  if (places_[cause].insert(place).second) ++known.places;
}

}  // namespace qz::tools::check
