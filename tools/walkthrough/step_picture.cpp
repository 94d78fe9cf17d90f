// SPDX-License-Identifier: MIT
// Takes pictures of a walk-through.
#include "tools/walkthrough/step_picture.hpp"

#include <algorithm>
#include <set>
#include <utility>

namespace qz::tools::walkthrough {
namespace {

ControlPicture lookAtControl(drivers::Driver& driver, const QZ_Plist_State_Parser& engine,
                             const toolkit::Ref<toolkit::View>& view) {
  const std::string key = std::to_string(view->tag());
  ControlPicture picture;
  picture.identity = view.pointer();
  picture.view = driver.look(view);
  picture.flashing = engine.flashing() && engine.flashingTimer()->isValid() &&
                     view->asButton() != nullptr &&
                     engine.flashingTagIds()->objectForKey(key)->boolValue();
  picture.hasList = static_cast<bool>(engine.plistDictionary()->objectForKey(key));
  return picture;
}

std::vector<ControlPicture> lookAtControls(drivers::Driver& driver,
                                           const QZ_Plist_State_Parser& engine) {
  std::vector<ControlPicture> controls;
  std::set<toolkit::Tag> tags;
  const auto content = engine.tutorialWindow()->contentView();
  for (const auto& view : content->subviews()) {
    ControlPicture& control = controls.emplace_back(lookAtControl(driver, engine, view));
    control.shadowed = !tags.insert(view->tag()).second;
    if (control.shadowed) control.flashing = false;  // the control behind it flashes instead
  }
  return controls;
}

std::vector<TimerPicture> lookAtTimers(const QZ_Plist_State_Parser& engine) {
  std::vector<TimerPicture> timers;
  const auto table = engine.objectIdTimers();
  for (const auto& [key, timer] : table->entries()) {
    timers.push_back({timer.pointer(), key, timer->timeLeft()});
  }
  std::stable_sort(timers.begin(), timers.end(), [](const TimerPicture& a, const TimerPicture& b) {
    return a.timeLeft < b.timeLeft;
  });
  return timers;
}

}  // namespace

StepPicture takePicture(drivers::Driver& driver, const QZ_Plist_State_Parser& engine,
                        std::string title) {
  StepPicture picture;
  picture.title = std::move(title);
  if (const auto window = engine.tutorialWindow()) picture.window = driver.look(window);
  picture.controls = lookAtControls(driver, engine);
  picture.timers = lookAtTimers(engine);
  if (engine.lastTagId()) picture.lastList = engine.currentCommandState();
  picture.flashingAllowed = engine.flashing();
  picture.ended = engine.terminating();
  return picture;
}

}  // namespace qz::tools::walkthrough
