// SPDX-License-Identifier: MIT
// Takes pictures of a walk-through.
#include "tools/walkthrough/step_picture.hpp"

#include <algorithm>
#include <functional>
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
    timers.push_back({.identity = timer.pointer(), .key = key, .timeLeft = timer->timeLeft()});
  }
  std::stable_sort(timers.begin(), timers.end(), [](const TimerPicture& a, const TimerPicture& b) {
    return a.timeLeft < b.timeLeft;
  });
  return timers;
}

class Hash {
 public:
  template <class T>
  void add(const T& value) {
    // As Boost's hash_combine: the golden ratio and shifts keep the order of the values apart.
    hash_ ^= std::hash<T>()(value) + 0x9e3779b9U + (hash_ << 6U) + (hash_ >> 2U);
  }
  std::size_t value() const { return hash_; }

 private:
  std::size_t hash_ = 0;
};

void addTo(Hash& hash, const drivers::ViewPicture& view) {
  hash.add(view.className);
  hash.add(view.tag);
  hash.add(view.hidden);
  hash.add(view.enabled);
  hash.add(static_cast<int>(view.state));
  hash.add(view.highlighted);
  hash.add(view.title.string());
  hash.add(view.text.string());
  hash.add(view.toolTip);
  hash.add(view.image);
}

void addTo(Hash& hash, const ControlPicture& control) {
  addTo(hash, control.view);
  hash.add(control.flashing);
}

void addTo(Hash& hash, const TimerPicture& timer) {
  hash.add(timer.key);
  hash.add(timer.timeLeft);
}

}  // namespace

std::size_t hashOf(const StepPicture& picture) {
  Hash hash;
  for (const ControlPicture& control : picture.controls) addTo(hash, control);
  for (const TimerPicture& timer : picture.timers) addTo(hash, timer);
  hash.add(picture.lastList);
  hash.add(picture.flashingAllowed);
  hash.add(picture.ended);
  return hash.value();
}

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
