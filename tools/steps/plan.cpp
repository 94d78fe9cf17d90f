// SPDX-License-Identifier: MIT
// What is decided before any list is written.
#include "tools/steps/plan.hpp"

#include <algorithm>

namespace qz::tools::steps {
namespace {

void addOnce(std::vector<Tag>& tags, Tag tag) {
  if (std::find(tags.begin(), tags.end(), tag) == tags.end()) tags.push_back(tag);
}

}  // namespace

Plan::Plan(const Tour& tour, Scenes scenes)
    : tour_(tour),
      scenes_(std::move(scenes)),
      initial_(initialLook(tour)),
      everyStep_(everyStepLook(tour)) {
  for (const Control& control : tour.controls) numbers_.reserve(control.tag);
  for (const Scene& scene : scenes_.list) addLook(scene);
  findWhatChanges();
  chooseOwnTags();
  chooseOwnUses();
  chooseTags();
}

void Plan::addLook(const Scene& scene) {
  const auto [known, isNew] =
      lookNumbers_.try_emplace({scene.step, scene.canGoBack}, looks_.size());
  if (isNew) looks_.push_back(lookOf(tour_, scene.step, scene.canGoBack));
  lookOfScene_.push_back(known->second);
}

std::optional<Wait> Plan::waitOf(SceneIndex scene) const {
  return scenes_.list[scene].wait ? waitAt(tour_, scenes_.list[scene].step) : std::nullopt;
}

bool Plan::flashesIn(SceneIndex scene) const {
  const auto& controls = look(scene).controls;
  return std::any_of(controls.begin(), controls.end(), [](const auto& c) { return c.flashes; });
}

void Plan::findWhatChanges() {
  for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
    for (std::size_t p = 0; p < propertyCount; ++p) {
      const auto property = static_cast<Property>(p);
      if (changes(i, property)) varying_.push_back({i, property});
    }
  }
  changesBackground_ = std::any_of(looks_.begin(), looks_.end(), [&](const Look& look) {
    return look.background != initial_.background;
  });
}

bool Plan::changes(ControlIndex control, Property property) const {
  if (property == Property::state) return isStateSaid(control);  // the user changes it too
  return std::any_of(looks_.begin(), looks_.end(), [&](const Look& look) {
    return look.controls[control][property] != initial_.controls[control][property];
  });
}

bool Plan::isStateSaid(ControlIndex control) const {
  const auto says = [&](const StepWords& words) {
    return words.controls[control].isOn.has_value();
  };
  return says(tour_.everyStep) || std::any_of(tour_.steps.begin(), tour_.steps.end(),
                                              [&](const Step& step) { return says(step.words); });
}

std::optional<Plan::Everywhere> Plan::everywhere(SceneIndex scene, ControlIndex control) const {
  const auto& press = scenes_.list[scene].presses[control];
  if (!press || press->kind == Exit::Kind::scene) return std::nullopt;
  if (press->kind == Exit::Kind::end) return Everywhere::ends;
  const auto wait = waitOf(scene);
  if (wait && wait->startsAgain) return std::nullopt;
  return Everywhere::doesNothing;
}

/// Commands find only the back-most of the controls that share a tag.
bool Plan::sharesTagWithName(ControlIndex control) const {
  bool isBehind = false;
  bool isNamed = false;
  for (const Control& each : tour_.controls) {
    if (each.tag != tour_.controls[control].tag) continue;
    isNamed |= isBehind && !each.name.empty();
    isBehind = true;
  }
  return isNamed;
}

void Plan::chooseOwnTags() {
  for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
    const Control& control = tour_.controls[i];
    const std::string number = control.name.empty() ? std::to_string(i) : control.name;
    ownTags_.push_back(sharesTagWithName(i) ? numbers_.of("control\t" + number) : control.tag);
  }
}

/// A button keeps its own tag where it does one thing that is the same in every scene.
void Plan::chooseOwnUses() {
  ownUse_.resize(tour_.controls.size());
  for (SceneIndex scene = 0; scene < scenes_.list.size(); ++scene) {
    for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
      const auto use = everywhere(scene, i);
      if (!use || look(scene).controls[i].flashes) continue;
      if (ownUse_[i] != Everywhere::ends) ownUse_[i] = use;
    }
  }
}

void Plan::chooseTags() {
  tags_.resize(scenes_.list.size());
  for (SceneIndex scene = 0; scene < scenes_.list.size(); ++scene) {
    for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
      tags_[scene].push_back(tagFor(scene, i));
      if (look(scene).controls[i].flashes) addOnce(flashing_, tags_[scene][i]);
    }
  }
  for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
    keepsTag_.push_back(hasOwnTagEverywhere(i));
  }
}

Tag Plan::tagFor(SceneIndex scene, ControlIndex control) {
  const Tag own = ownTag(control);
  if (!scenes_.list[scene].presses[control]) return own;
  // A tag flashes for the whole walk-through or never.
  const bool flashes = look(scene).controls[control].flashes;
  const auto use = everywhere(scene, control);
  if (use && !flashes && ownUse_[control] == use) return own;
  const std::string what =
      use ? (use == Everywhere::ends ? "ends" : "does nothing") : nameOf(scene);
  return numbers_.of(nameOfControl(control) + (flashes ? "\tflashing\t" : "\t") + what);
}

bool Plan::hasOwnTagEverywhere(ControlIndex control) const {
  return std::all_of(tags_.begin(), tags_.end(), [&](const std::vector<Tag>& tags) {
    return tags[control] == ownTag(control);
  });
}

std::string Plan::nameOf(SceneIndex scene) const {
  std::string name = stepOf(scene).name;
  const auto& cameFrom = scenes_.list[scene].cameFrom;
  if (!cameFrom) return name;
  name += "\tfrom";
  for (const StepIndex step : *cameFrom) name += '\n' + tour_.steps[step].name;
  return name;
}

std::string Plan::nameOfControl(ControlIndex control) const {
  const Control& known = tour_.controls[control];
  return known.name.empty() ? std::to_string(known.tag) : known.name;
}

Tag Plan::timerKey(SceneIndex scene) { return numbers_.of("after\t" + nameOf(scene)); }

Tag Plan::lookKey(SceneIndex scene) {
  return numbers_.of("look\t" + stepOf(scene).name +
                     (scenes_.list[scene].canGoBack ? "\tback" : ""));
}

Tag Plan::startKey(std::size_t start) {
  if (start > 0) return numbers_.of("start\t" + stepOf(scenes_.starts[start]).name);
  Tag least = 1;
  for (const Control& control : tour_.controls) least = std::min(least, control.tag);
  return least - 1;
}

}  // namespace qz::tools::steps
