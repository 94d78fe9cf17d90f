// SPDX-License-Identifier: MIT
#include "tools/diff/step_names.hpp"

#include "tools/support/text_layout.hpp"

namespace qz::tools::diff {

std::string StepName::words() const {
  return text.empty() ? name : name + " (" + quoteStart(text) + ")";
}

StepNames::StepNames(const comparison::Behavior& behavior) : behavior_(behavior) {}

StepName StepNames::of(comparison::SituationIndex situationIndex) const {
  const comparison::Situation& situation = behavior_.situations()[situationIndex];
  if (situation.isOver) return {"the end", ""};
  const std::string name = sourceName(situation.visit);
  if (!name.empty()) return {"the step " + quote(name), ""};
  const std::string key = listKey(behavior_.exploration().visits()[situation.visit].lastList);
  return {key.empty() ? "the start" : "the step of list " + quote(key), firstText(situation)};
}

std::string StepNames::listKey(std::uint32_t list) const {
  return list == check::noList ? "" : behavior_.exploration().setting().script.lists()[list].key;
}

/// A list that leads to no step leaves the walk-through in the step before.
std::string StepNames::sourceName(std::uint32_t visit) const {
  const auto& exploration = behavior_.exploration();
  const auto& names = exploration.setting().plan.names;
  for (; visit != check::noVisit; visit = exploration.visits()[visit].parent) {
    std::string name = names.stepOf(listKey(exploration.visits()[visit].lastList));
    if (!name.empty()) return name;
  }
  return "";
}

/// Returns what the user reads first that is not on a button.
std::string StepNames::firstText(const comparison::Situation& situation) const {
  for (const comparison::Appearance& control : situation.controls) {
    if (!control.isShown) continue;
    const std::string& text = behavior_.looks().look(control.look).view.text.string();
    if (!text.empty()) return text;
  }
  return "";
}

}  // namespace qz::tools::diff
