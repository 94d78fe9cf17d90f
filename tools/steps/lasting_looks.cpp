// SPDX-License-Identifier: MIT
// A step has what it says, and what lasts from the steps before it.
#include "tools/steps/lasting_looks.hpp"

#include <functional>
#include <set>
#include <string>
#include <vector>

#include "tools/support/text_layout.hpp"

namespace qz::tools::steps {
namespace {

using OfLook = std::function<bool(const Look&)>;

bool isShown(const Look& look, ControlIndex control) {
  return look.controls[control][Property::shown].front().name == "SHOW_OBJECT_WITH_ID";
}

class LastingLooks {
 public:
  LastingLooks(const Tour& tour, const Scenes& scenes, Mistakes& mistakes)
      : tour_(tour), mistakes_(mistakes), next_(tour.steps.size()) {
    for (StepIndex i = 0; i < tour.steps.size(); ++i) looks_.push_back(lookOf(tour, i, true));
    for (const Scene& scene : scenes.list) {
      for (const auto& press : scene.presses) add(scene, press, scenes);
      add(scene, scene.wait, scenes);
    }
  }

  void run() {
    judge([](const Look& look) { return !look.background.empty(); },
          [](const Look& look) { return look.background.empty(); }, "the background",
          "“background” here or under “every step”");
    for (ControlIndex i = 0; i < tour_.controls.size(); ++i) {
      const drivers::ViewKindRow& row = rowOf(tour_.controls[i].kind);
      if (row.isButton) judgeRed(i);
      if (row.caption == drivers::Caption::imageName) judgePicture(i);
    }
  }

 private:
  void add(const Scene& from, const std::optional<Exit>& exit, const Scenes& scenes) {
    if (!exit || exit->kind != Exit::Kind::scene) return;
    next_[from.step].insert(scenes.list[exit->scene].step);
  }

  void judgeRed(ControlIndex control) {
    const auto isRed = [control](const Look& look) {
      return !look.controls[control][Property::background].empty();
    };
    judge(
        isRed, [=](const Look& look) { return isShown(look, control) && !isRed(look); },
        "the red of " + quote(tour_.controls[control].name),
        "“background: red” here or under “every step”");
  }

  void judgePicture(ControlIndex control) {
    const auto hasPicture = [control](const Look& look) {
      return !look.controls[control][Property::content].empty();
    };
    judge(
        hasPicture, [=](const Look& look) { return isShown(look, control) && !hasPicture(look); },
        "the picture of " + quote(tour_.controls[control].name), "“picture” or “hide”");
  }

  /// Adds a mistake if a step that lacks something comes after one that has it.
  void judge(const OfLook& has, const OfLook& lacks, const std::string& what,
             const std::string& expected) {
    std::vector<StepIndex> pending;
    for (StepIndex i = 0; i < looks_.size(); ++i) {
      if (has(looks_[i])) pending.push_back(i);
    }
    std::set<StepIndex> after;
    while (!pending.empty()) {
      const StepIndex step = pending.back();
      pending.pop_back();
      for (const StepIndex next : next_[step]) {
        if (!has(looks_[next]) && after.insert(next).second) pending.push_back(next);
      }
    }
    for (const StepIndex step : after) {
      if (!lacks(looks_[step])) continue;
      mistakes_.add(tour_.steps[step].place,
                    "the step " + quote(tour_.steps[step].name) +
                        " would keep what a step before it shows, because no command takes away " +
                        what + "; expected " + expected);
    }
  }

  const Tour& tour_;
  Mistakes& mistakes_;
  std::vector<Look> looks_;                // of each step
  std::vector<std::set<StepIndex>> next_;  // to which moves out of each step lead
};

}  // namespace

void judgeLastingLooks(const Tour& tour, const Scenes& scenes, Mistakes& mistakes) {
  LastingLooks(tour, scenes, mistakes).run();
}

}  // namespace qz::tools::steps
