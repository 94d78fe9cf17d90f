// SPDX-License-Identifier: MIT
// Every control has a tag of its own here, so that commands find it.
#include "tools/lift/stand.hpp"

#include <algorithm>

#include "toolkit/memory/parts.hpp"
#include "tools/steps/source.hpp"

namespace qz::tools::lift {
namespace {

using toolkit::Array;
using toolkit::Dictionary;
using toolkit::Number;
using toolkit::String;
using toolkit::ValueRef;
using toolkit::memory::ViewNode;

constexpr toolkit::Tag firstStandTag = 1000;  // of the controls
constexpr const char* standKey = "1";         // of the list that is played

toolkit::Tag standTag(ControlIndex control) {
  return firstStandTag + static_cast<toolkit::Tag>(control);
}

ValueRef<> standValue(const steps::Parameter& parameter) {
  if (const auto* text = std::get_if<std::string>(&parameter)) return String::make(*text);
  if (const auto* number = std::get_if<int>(&parameter)) return Number::withLong(*number);
  return Number::withBool(std::get<bool>(parameter));
}

ValueRef<> standCommand(const steps::Command& command, ControlIndex control) {
  std::vector<ValueRef<>> parts = {String::make(command.name)};
  for (const auto& parameter : command.parameters) parts.push_back(standValue(parameter));
  parts.emplace_back(Number::withLong(standTag(control)));
  return Array::make(std::move(parts));
}

}  // namespace

Stand::Stand(const walkthrough::StagePlan& plan, const std::string& resources, check::Looks& looks)
    : looks_(looks),
      controls_(steps::controlsOf(plan, resources)),
      driver_(std::make_unique<drivers::MemoryDriver>()) {
  driver_->setResourcePath(resources);
  stage_ = std::make_unique<walkthrough::Stage>(*driver_, plan);
  const auto views = stage_->engine().tutorialWindow()->contentView()->subviews();
  for (ControlIndex i = 0; i < views.size(); ++i) views[i]->setTag(standTag(i));
}

LookValue Stand::show(ControlIndex control, const steps::ControlWords& words) {
  steps::Tour tour{.controls = controls_};
  tour.everyStep.controls.resize(controls_.size());
  steps::Step step;
  step.words.controls.resize(controls_.size());
  step.words.controls[control] = words;
  tour.steps.push_back(step);
  const steps::Look look = lookOf(tour, 0, true);
  List list;
  for (const auto property :
       {steps::Property::content, steps::Property::toolTip, steps::Property::background}) {
    for (const auto& command : look.controls[control][property]) {
      list.push_back(standCommand(command, control));
    }
  }
  return play(control, list);
}

LookValue Stand::run(ControlIndex control, const check::Element& element) {
  const auto position = element.command->positionOf(ParameterType::controlTag);
  if (!element.isCompound || !position) return play(control, {element.value});
  const auto given = toolkit::asArray(element.value)->elements();
  List parts(given.begin(), given.end());
  parts.resize(std::max(parts.size(), *position + 2));
  parts[*position + 1] = Number::withLong(standTag(control));
  return play(control, {Array::make(std::move(parts))});
}

LookValue Stand::play(ControlIndex control, const List& list) {
  const auto view = stage_->engine().tutorialWindow()->contentView()->subviews()[control];
  ViewNode& node = *ViewNode::of(view);
  const auto before = node.save();
  const ValueRef<> commands = Array::make(list);
  stage_->start(Dictionary::make({{String::make(standKey), commands}}), standKey);
  check::ViewLook seen{node.save(), true};
  if (!view->asTextField()) seen.view.text = {};
  node.restore(before);
  return looks_.valueOf(seen);
}

}  // namespace qz::tools::lift
