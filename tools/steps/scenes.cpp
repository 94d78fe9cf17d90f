// SPDX-License-Identifier: MIT
// Finds every step with every way that leads to it, and then joins those that differ in nothing.
#include "tools/steps/scenes.hpp"

#include <algorithm>
#include <map>
#include <numeric>

#include "tools/support/text_layout.hpp"

namespace qz::tools::steps {
namespace {

using WayIndex = std::size_t;

/// Ways: the steps to which Back leads, the next one last. No step is twice on a way: going to a
/// step that is on the way is going back to it. Ways share what they have in common.
class Ways {
 public:
  static constexpr WayIndex empty = 0;

  WayIndex extended(WayIndex way, StepIndex step) {
    const auto [known, isNew] = numbers_.try_emplace({way, step}, nodes_.size());
    if (isNew) nodes_.push_back({way, step, nodes_[way].length + 1});
    return known->second;
  }
  StepIndex last(WayIndex way) const { return nodes_[way].step; }
  WayIndex withoutLast(WayIndex way) const { return nodes_[way].before; }
  std::size_t length(WayIndex way) const { return nodes_[way].length; }

  /// Returns the part of the way before the step; the whole way if the step is not on it.
  WayIndex before(WayIndex way, StepIndex step) const {
    for (WayIndex i = way; i != empty; i = nodes_[i].before) {
      if (nodes_[i].step == step) return nodes_[i].before;
    }
    return way;
  }

  /// Returns the last steps of the way, the latest last.
  std::vector<StepIndex> end(WayIndex way, std::size_t most) const {
    std::vector<StepIndex> steps;
    for (; way != empty && steps.size() < most; way = nodes_[way].before) {
      steps.push_back(nodes_[way].step);
    }
    std::reverse(steps.begin(), steps.end());
    return steps;
  }

  WayIndex shortened(WayIndex way, std::size_t most) {
    if (length(way) <= most) return way;
    WayIndex shorter = empty;
    for (const StepIndex step : end(way, most)) shorter = extended(shorter, step);
    return shorter;
  }

 private:
  struct Node {
    WayIndex before;
    StepIndex step;
    std::size_t length;
  };
  std::vector<Node> nodes_ = {{empty, 0, 0}};
  std::map<std::pair<WayIndex, StepIndex>, WayIndex> numbers_;
};

/// A step, and the way to it.
struct Situation {
  Scene scene{};
  WayIndex way = Ways::empty;
};

class Finder {
 public:
  Finder(const Tour& tour, Mistakes& mistakes, std::size_t mostWays)
      : tour_(tour), mistakes_(mistakes), mostWays_(mostWays) {}

  SceneIndex add(StepIndex step, WayIndex way) {
    const auto [known, isNew] = numbers_.try_emplace({step, way}, situations_.size());
    if (isNew) {
      situations_.push_back({{.step = step, .canGoBack = way != Ways::empty}, way});
    }
    return known->second;
  }

  /// Returns NO if there are too many ways.
  bool run() {
    for (SceneIndex i = 0; i < situations_.size(); ++i) {
      if (situations_.size() > mostWays_) {
        refuse(situations_[i].scene.step);
        return false;
      }
      leave(i);
    }
    return true;
  }

  const Ways& ways() const { return ways_; }
  std::vector<Situation> take() { return std::move(situations_); }

 private:
  void refuse(StepIndex step) {
    mistakes_.add(tour_.steps[step].place,
                  "more than " + std::to_string(mostWays_) + " ways lead to the steps up to " +
                      quote(tour_.steps[step].name) +
                      "; expected “back over” with a small number of steps");
  }

  const std::vector<std::optional<Lead>>& pressesAt(StepIndex step, bool canGoBack) {
    const auto [known, isNew] = presses_.try_emplace({step, canGoBack});
    if (isNew) {
      for (const ControlLook& control : lookOf(tour_, step, canGoBack).controls) {
        known->second.push_back(control.canBePressed ? std::optional(control.press) : std::nullopt);
      }
    }
    return known->second;
  }

  void leave(SceneIndex from) {
    const StepIndex step = situations_[from].scene.step;
    std::vector<std::optional<Exit>> exits;
    for (const auto& press : pressesAt(step, situations_[from].scene.canGoBack)) {
      exits.push_back(press ? std::optional(follow(from, *press)) : std::nullopt);
    }
    situations_[from].scene.presses = std::move(exits);
    const auto& wait = waitAt(tour_, step);
    if (!wait) return;
    const Exit exit = follow(from, wait->lead);
    if (exit.kind != Exit::Kind::nowhere) situations_[from].scene.wait = exit;
  }

  Exit follow(SceneIndex from, const Lead& lead) {
    const WayIndex way = situations_[from].way;
    switch (lead.kind) {
      case Lead::Kind::nowhere:
        return {};
      case Lead::Kind::end:
        return {Exit::Kind::end, 0};
      case Lead::Kind::back:
        if (way == Ways::empty) return {};
        return {Exit::Kind::scene, add(ways_.last(way), ways_.withoutLast(way))};
      case Lead::Kind::step:
        break;
    }
    return {Exit::Kind::scene, add(lead.step, wayTo(lead, situations_[from]))};
  }

  WayIndex wayTo(const Lead& lead, const Situation& from) {
    const StepIndex left = from.scene.step;
    if (lead.step == left) return from.way;
    const bool leavesNoTrace = lead.isInstead || isPassedOver(left);
    const WayIndex way = leavesNoTrace ? from.way : ways_.extended(from.way, left);
    return ways_.shortened(ways_.before(way, lead.step), tour_.mostStepsBack);
  }

  bool isPassedOver(StepIndex step) const {
    const auto& own = tour_.steps[step].words.isPassedOver;
    return (own ? own : tour_.everyStep.isPassedOver).value_or(false);
  }

  const Tour& tour_;
  Mistakes& mistakes_;
  std::size_t mostWays_;
  Ways ways_;
  std::vector<Situation> situations_;
  std::map<std::pair<StepIndex, WayIndex>, SceneIndex> numbers_;
  std::map<std::pair<StepIndex, bool>, std::vector<std::optional<Lead>>> presses_;
};

/// Numbers for classes: scenes of one class differ in nothing that is known so far.
using Classes = std::vector<std::size_t>;

std::size_t classOf(const Exit& exit, const Classes& classes) {
  return exit.kind == Exit::Kind::scene ? 3 + classes[exit.scene]
                                        : static_cast<std::size_t>(exit.kind);
}

/// Returns the class of a situation, and those of the situations to which its moves lead.
std::vector<std::size_t> classesAround(SceneIndex scene, const Scene& here,
                                       const Classes& classes) {
  std::vector<std::size_t> around = {classes[scene]};
  for (const auto& press : here.presses) {
    around.push_back(press ? 1 + classOf(*press, classes) : 0);
  }
  if (here.wait) around.push_back(classOf(*here.wait, classes));
  return around;
}

/// Divides the classes by where the moves lead, and returns how many classes there are.
std::size_t refine(const std::vector<Situation>& all, Classes& classes) {
  std::map<std::vector<std::size_t>, std::size_t> numbers;
  Classes refined;
  for (SceneIndex i = 0; i < all.size(); ++i) {
    const auto signature = classesAround(i, all[i].scene, classes);
    refined.push_back(numbers.try_emplace(signature, numbers.size()).first->second);
  }
  classes = std::move(refined);
  return numbers.size();
}

Classes classesOf(const std::vector<Situation>& all) {
  Classes classes;
  for (const Situation& situation : all) classes.push_back(situation.scene.step);
  for (std::size_t count = 0, refined = 1; refined != count;) {
    count = refined;
    refined = refine(all, classes);
  }
  return classes;
}

/// Gives each way the shortest end that no other of the ways has.
std::vector<std::vector<StepIndex>> distinctEnds(const Ways& ways,
                                                 const std::vector<WayIndex>& all) {
  std::vector<std::vector<StepIndex>> ends(all.size());
  std::vector<std::size_t> shared(all.size());
  std::iota(shared.begin(), shared.end(), 0);
  for (std::size_t length = 1; shared.size() > 1; ++length) {
    std::map<std::vector<StepIndex>, std::size_t> counts;
    for (const std::size_t i : shared) ++counts[ends[i] = ways.end(all[i], length)];
    std::erase_if(shared, [&](std::size_t i) { return counts[ends[i]] == 1; });
  }
  return ends;
}

/// Keeps the first scene of each class. Classes are numbered in the order of their first scenes.
Scenes joined(std::vector<Situation> all, const Ways& ways, std::size_t starts) {
  const Classes classes = classesOf(all);
  const auto pointOn = [&](std::optional<Exit>& exit) {
    if (exit && exit->kind == Exit::Kind::scene) exit->scene = classes[exit->scene];
  };
  Scenes result;
  std::map<StepIndex, std::vector<std::pair<SceneIndex, WayIndex>>> scenesOfSteps;
  for (SceneIndex i = 0; i < all.size(); ++i) {
    if (i < starts) result.starts.push_back(classes[i]);
    if (classes[i] != result.list.size()) continue;
    for (auto& press : all[i].scene.presses) pointOn(press);
    pointOn(all[i].scene.wait);
    scenesOfSteps[all[i].scene.step].emplace_back(result.list.size(), all[i].way);
    result.list.push_back(std::move(all[i].scene));
  }
  for (const auto& [step, scenes] : scenesOfSteps) {
    std::vector<WayIndex> waysHere;
    for (const auto& [scene, way] : scenes) waysHere.push_back(way);
    auto ends = distinctEnds(ways, waysHere);
    for (std::size_t i = 1; i < scenes.size(); ++i) {
      result.list[scenes[i].first].cameFrom = std::move(ends[i]);
    }
  }
  return result;
}

}  // namespace

Scenes findScenes(const Tour& tour, const std::vector<StepIndex>& starts, Mistakes& mistakes,
                  std::size_t mostWays) {
  Finder finder(tour, mistakes, mostWays);
  for (const StepIndex step : starts) finder.add(step, Ways::empty);
  if (!finder.run()) return {};
  return joined(finder.take(), finder.ways(), starts.size());
}

}  // namespace qz::tools::steps
