// SPDX-License-Identifier: MIT
// What places show.
#include "tests/check/looks.hpp"

#include <cmath>

namespace qz::naive {

namespace {

std::string textOf(const std::optional<Site>& site) {
  return site ? site->list + "#" + std::to_string(site->element) : "";
}

// The decisions about flashing, what gave each control its tag, what started each timer, and how
// long each text has been there.
std::vector<std::string> otherAspects(const World& world) {
  std::string flashing = world.flashingAllowed() ? "flashing" : "still";
  for (const auto& [key, flag] : world.flashMarks()) flashing += "," + key + (flag ? "=1" : "=0");
  std::vector<std::string> aspects = {flashing};
  const History& history = world.history();
  for (std::size_t i = 0; i < history.taggedBy.size(); ++i) {
    aspects.push_back("tag" + std::to_string(i) + ":" + textOf(history.taggedBy[i]));
  }
  for (const auto& [key, start] : history.starters) {
    aspects.push_back("timer" + key + ":" + textOf(start.site));
  }
  const auto controls = world.pictures();
  for (std::size_t i = 0; i < controls.size(); ++i) {
    if (std::isinf(history.textAge[i])) continue;
    aspects.push_back("age" + std::to_string(i) + ":" + std::to_string(history.textAge[i]) + " " +
                      controls[i].text.string());
  }
  return aspects;
}

std::set<toolkit::Tag> flashingTags(const World& world) {
  std::set<toolkit::Tag> tags;
  if (!world.flashingAllowed()) return tags;
  for (const auto& [key, flag] : world.flashMarks()) {
    if (flag) tags.insert(std::stoll(key));
  }
  return tags;
}

bool differs(const std::set<std::string>& values) {
  return values.size() - values.count(userState) > 1;
}

}  // namespace

bool Looks::note(std::size_t place, const World& world, std::size_t pathLength) {
  const auto [entry, isNew] = seen_.try_emplace({place, world.history().lastWord});
  Seen& seen = entry->second;
  bool anything = isNew;
  for (const std::string& aspect : otherAspects(world)) {
    anything = seen.others.insert(aspect).second || anything;
  }
  return noteControls(seen, world, pathLength) || anything;
}

bool Looks::noteControls(Seen& seen, const World& world, std::size_t pathLength) {
  bool anything = false;
  const auto controls = world.pictures();
  seen.controls.resize(controls.size());
  seen.flashing.resize(controls.size());
  auto flashing = flashingTags(world);
  for (std::size_t i = 0; i < controls.size(); ++i) {
    // Only the backmost control with a tag flashes.
    const bool flashes = flashing.erase(controls[i].tag) > 0 && isButton(controls[i].kind);
    bool differ = seen.flashing[i].insert(flashes).second && seen.flashing[i].size() > 1;
    const ControlLook look = world.lookOf(controls[i], i, numbers_);
    for (std::size_t k = 0; k < look.size(); ++k) {
      auto& values = seen.controls[i].at(k);
      const bool isNew = values.insert(look.at(k)).second;
      anything = anything || isNew;
      differ = differ || (isNew && differs(values));
    }
    if (differ && !controls[i].hidden) noteDifference(world, i, pathLength);
  }
  return anything;
}

void Looks::noteDifference(const World& world, std::size_t control, std::size_t pathLength) {
  const std::string& list = world.history().lastWord;
  if (list.empty() || !world.isOnScreen()) return;
  differences_.add({"looks-differ", list, std::nullopt, world.ownTags()[control], pathLength});
}

void Looks::report(Findings& findings) const {
  for (const Finding& finding : differences_.all()) findings.add(finding);
}

}  // namespace qz::naive
