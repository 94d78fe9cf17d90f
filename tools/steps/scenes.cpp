// SPDX-License-Identifier: MIT
// Finds every step with every way that leads to it, and then joins those that differ in nothing.
#include "tools/steps/scenes.hpp"

#include <algorithm>
#include <map>

#include "tools/support/text_layout.hpp"

namespace qz::tools::steps {
namespace {

/// The steps to which Back leads, the next one last. No step is twice on a way: going to a step that
/// is on the way is going back to it.
using Way = std::vector<StepIndex>;

// Each needs lists of its own unless they can be joined, so a script of more would not be usable.
constexpr std::size_t mostSituations = 200000;

class Finder {
 public:
  Finder(const Tour& tour, Mistakes& mistakes) : tour_(tour), mistakes_(mistakes) {}

  SceneIndex add(StepIndex step, Way way) {
    const auto [known, isNew] = numbers_.try_emplace({step, way}, situations_.size());
    if (isNew) {
      Scene scene{.step = step, .way = std::move(way)};
      scene.canGoBack = !scene.way.empty();
      situations_.push_back(std::move(scene));
    }
    return known->second;
  }

  void run() {
    for (SceneIndex i = 0; i < situations_.size(); ++i) {
      if (situations_.size() > mostSituations) return refuse(situations_[i].step);
      leave(i);
    }
  }

  std::vector<Scene> take() { return std::move(situations_); }

 private:
  void refuse(StepIndex step) {
    mistakes_.add(tour_.steps[step].place,
                  "more than " + std::to_string(mostSituations) + " ways lead to the steps up to " +
                      quote(tour_.steps[step].name) + "; expected a smaller number at “back over”");
  }

  void leave(SceneIndex from) {
    const StepIndex step = situations_[from].step;
    const Look look = lookOf(tour_, step, situations_[from].canGoBack);
    std::vector<std::optional<Exit>> presses;
    for (const ControlLook& control : look.controls) {
      presses.push_back(control.canBePressed ? std::optional(follow(from, control.press))
                                             : std::nullopt);
    }
    situations_[from].presses = std::move(presses);
    const auto& wait = waitOf(step);
    if (wait) situations_[from].wait = follow(from, wait->lead);
  }

  const std::optional<Wait>& waitOf(StepIndex step) const {
    const auto& own = tour_.steps[step].words.wait;
    return own ? own : tour_.everyStep.wait;
  }

  Exit follow(SceneIndex from, const Lead& lead) {
    const Way& way = situations_[from].way;
    switch (lead.kind) {
      case Lead::Kind::nowhere:
        return {};
      case Lead::Kind::end:
        return {Exit::Kind::end, 0};
      case Lead::Kind::back:
        if (way.empty()) return {};
        return {Exit::Kind::scene, add(way.back(), Way(way.begin(), way.end() - 1))};
      case Lead::Kind::step:
        break;
    }
    return {Exit::Kind::scene, add(lead.step, wayTo(lead.step, situations_[from]))};
  }

  Way wayTo(StepIndex step, const Scene& from) const {
    Way way = from.way;
    const auto& words = tour_.steps[from.step].words;
    const auto isPassedOver = words.isPassedOver ? words.isPassedOver : tour_.everyStep.isPassedOver;
    if (!isPassedOver.value_or(false)) way.push_back(from.step);
    way.erase(std::find(way.begin(), way.end(), step), way.end());
    if (way.size() > tour_.mostStepsBack) way.erase(way.begin());
    return way;
  }

  const Tour& tour_;
  Mistakes& mistakes_;
  std::vector<Scene> situations_;
  std::map<std::pair<StepIndex, Way>, SceneIndex> numbers_;
};

/// Numbers for classes: scenes of one class differ in nothing that is known so far.
using Classes = std::vector<std::size_t>;

std::size_t classOf(const Exit& exit, const Classes& classes) {
  return exit.kind == Exit::Kind::scene ? 3 + classes[exit.scene] : static_cast<std::size_t>(exit.kind);
}

/// Divides the classes by where the moves lead, and returns how many classes there are.
std::size_t refine(const std::vector<Scene>& scenes, Classes& classes) {
  std::map<std::vector<std::size_t>, std::size_t> numbers;
  Classes refined;
  for (SceneIndex i = 0; i < scenes.size(); ++i) {
    std::vector<std::size_t> signature = {classes[i]};
    for (const auto& press : scenes[i].presses) {
      signature.push_back(press ? 1 + classOf(*press, classes) : 0);
    }
    if (scenes[i].wait) signature.push_back(classOf(*scenes[i].wait, classes));
    refined.push_back(numbers.try_emplace(signature, numbers.size()).first->second);
  }
  classes = std::move(refined);
  return numbers.size();
}

Classes classesOf(const std::vector<Scene>& scenes) {
  Classes classes;
  for (const Scene& scene : scenes) classes.push_back(scene.step);
  for (std::size_t count = 0, refined = 1; refined != count;) {
    count = refined;
    refined = refine(scenes, classes);
  }
  return classes;
}

/// Keeps the first scene of each class. Classes are numbered in the order of their first scenes.
Scenes joined(std::vector<Scene> scenes, std::size_t starts) {
  const Classes classes = classesOf(scenes);
  const auto pointOn = [&](std::optional<Exit>& exit) {
    if (exit && exit->kind == Exit::Kind::scene) exit->scene = classes[exit->scene];
  };
  Scenes result;
  for (SceneIndex i = 0; i < scenes.size(); ++i) {
    if (i < starts) result.starts.push_back(classes[i]);
    if (classes[i] != result.list.size()) continue;
    for (auto& press : scenes[i].presses) pointOn(press);
    pointOn(scenes[i].wait);
    result.list.push_back(std::move(scenes[i]));
  }
  return result;
}

}  // namespace

Scenes findScenes(const Tour& tour, const std::vector<StepIndex>& starts, Mistakes& mistakes) {
  Finder finder(tour, mistakes);
  for (const StepIndex step : starts) finder.add(step, {});
  finder.run();
  return joined(finder.take(), starts.size());
}

}  // namespace qz::tools::steps
