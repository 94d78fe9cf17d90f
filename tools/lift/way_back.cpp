// SPDX-License-Identifier: MIT
// Assumes that every press leads back that can, and that all steps are one which look the same.
// Then follows the walk together with the way of the language, and gives up what does not fit.
#include "tools/lift/way_back.hpp"

#include <algorithm>
#include <map>
#include <set>
#include <tuple>
#include <utility>

namespace qz::tools::lift {
namespace {

using GroupIndex = std::size_t;
using ControlNumber = std::size_t;

// Beyond, nobody would see through the ways.
constexpr std::size_t mostPairs = 20000;

class WayFinder {
 public:
  WayFinder(const Behavior& behavior, const Walk& walk)
      : behavior_(behavior), walk_(walk), groups_(walk.steps.size()) {
    group();
    findCandidates();
  }

  Walk run() {
    while (true) {
      if (!settle()) return walk_;
      const auto odd = oddBackControl();
      if (!odd) break;
      std::erase_if(back_, [&](const auto& each) { return each.second == *odd; });
    }
    return back_.empty() ? walk_ : merged();
  }

 private:
  using Way = std::vector<GroupIndex>;

  const std::vector<std::optional<Lead>>& presses(StepIndex step) const {
    return walk_.steps[step].presses;
  }
  static bool isToStep(const std::optional<Lead>& lead) {
    return lead && lead->kind == Lead::Kind::step;
  }

  /// Steps that look the same are one group at first.
  void group() {
    std::map<std::tuple<std::vector<comparison::Appearance>, LookNumbers, bool>, GroupIndex> known;
    for (StepIndex i = 0; i < walk_.steps.size(); ++i) {
      const Step& step = walk_.steps[i];
      const auto& situation = behavior_.situations()[step.situation];
      LookNumbers numbers = {static_cast<double>(situation.background), step.seconds.value_or(-1)};
      for (const auto& state : step.states)
        numbers.push_back(state ? static_cast<int>(*state) : -1);
      groups_[i] =
          known.try_emplace({seenAt(situation), numbers, step.givesUp}, count_).first->second;
      count_ = std::max(count_, groups_[i] + 1);
    }
  }

  /// What a user makes of states tells no steps apart, so one of its steps may have any.
  std::vector<comparison::Appearance> seenAt(const comparison::Situation& situation) {
    auto seen = situation.controls;
    for (auto& control : seen) {
      if (control.isShown) {
        control.look = stateless_.valueOf({behavior_.looks().look(control.look).view, true});
      }
    }
    return seen;
  }

  /// A press may lead back if something leads from there to here.
  void findCandidates() {
    std::map<std::pair<StepIndex, StepIndex>, std::set<ControlNumber>> leads;
    constexpr auto wait = static_cast<ControlNumber>(-1);
    for (StepIndex i = 0; i < walk_.steps.size(); ++i) {
      for (ControlNumber c = 0; c < presses(i).size(); ++c) {
        if (isToStep(presses(i)[c])) leads[{i, presses(i)[c]->step}].insert(c);
      }
      const Step& step = walk_.steps[i];
      if (step.seconds && isToStep(step.wait)) leads[{i, step.wait.step}].insert(wait);
    }
    for (const auto& [between, controls] : leads) {
      const auto there = leads.find({between.second, between.first});
      if (there == leads.end() || between.first == between.second) continue;
      for (const ControlNumber c : controls) {
        const bool isOther = there->second.size() > 1 || !there->second.contains(c);
        if (c != wait && isOther) back_.emplace(groups_[between.first], c);
      }
    }
  }

  /// Gives up what does not fit until all fits. Returns NO if that cannot be told.
  bool settle() {
    while (true) {
      while (const auto torn = tornGroup()) split(*torn);
      const auto faults = follow();
      if (ways_.size() > mostPairs) return false;
      if (faults.empty()) return true;
      for (const auto& fault : faults) back_.erase(fault);
    }
  }

  /// Returns a group in which a press leads to different groups, but not back.
  std::optional<GroupIndex> tornGroup() const {
    std::map<std::pair<GroupIndex, ControlNumber>, std::tuple<int, GroupIndex>> known;
    const auto fits = [&](StepIndex from, ControlNumber c, const Lead& lead) {
      if (back_.contains({groups_[from], c})) return isToStep(lead);
      const std::tuple<int, GroupIndex> target = {static_cast<int>(lead.kind),
                                                  isToStep(lead) ? groups_[lead.step] : 0};
      return known.try_emplace({groups_[from], c}, target).first->second == target;
    };
    for (StepIndex i = 0; i < walk_.steps.size(); ++i) {
      for (ControlNumber c = 0; c < presses(i).size(); ++c) {
        if (presses(i)[c] && !fits(i, c, *presses(i)[c])) return groups_[i];
      }
      if (walk_.steps[i].seconds && !fits(i, presses(i).size(), walk_.steps[i].wait)) {
        return groups_[i];
      }
    }
    return std::nullopt;
  }

  /// Makes every step of the group a group of its own.
  void split(GroupIndex torn) {
    const auto controls = takeMarks(torn);
    bool isFirst = true;
    for (StepIndex i = 0; i < groups_.size(); ++i) {
      if (groups_[i] != torn) continue;
      if (!std::exchange(isFirst, false)) groups_[i] = count_++;
      for (const ControlNumber c : controls) {
        if (isToStep(presses(i)[c])) back_.emplace(groups_[i], c);
      }
    }
  }

  /// Returns the controls that lead back from a group, which from now on has none.
  std::set<ControlNumber> takeMarks(GroupIndex group) {
    std::set<ControlNumber> controls;
    for (const auto& [each, control] : back_) {
      if (each == group) controls.insert(control);
    }
    for (const ControlNumber c : controls) back_.erase({group, c});
    return controls;
  }

  using Marks = std::set<std::pair<GroupIndex, ControlNumber>>;

  /// Follows the walk with the way. Returns the presses that do not lead back.
  Marks follow() {
    Marks faults;
    ways_ = {{0, Way{}}};
    std::vector<std::pair<StepIndex, Way>> pending(ways_.begin(), ways_.end());
    const auto arrive = [&](StepIndex step, Way way) {
      std::pair<StepIndex, Way> pair{step, std::move(way)};
      if (ways_.insert(pair).second) pending.push_back(std::move(pair));
    };
    for (std::size_t i = 0; i < pending.size() && ways_.size() <= mostPairs; ++i) {
      const auto [step, way] = pending[i];
      const Step& here = walk_.steps[step];
      if (here.seconds && isToStep(here.wait)) {
        arrive(here.wait.step, wayTo(here.wait.step, step, way));
      }
      for (ControlNumber c = 0; c < presses(step).size(); ++c) {
        if (!isToStep(presses(step)[c])) continue;
        const StepIndex to = presses(step)[c]->step;
        const bool isMarked = back_.contains({groups_[step], c});
        const bool isBack = isMarked && !way.empty() && way.back() == groups_[to];
        if (isMarked && !isBack) faults.emplace(groups_[step], c);
        arrive(to, isBack ? Way(way.begin(), way.end() - 1) : wayTo(to, step, way));
      }
    }
    return faults;
  }

  Way wayTo(StepIndex to, StepIndex from, Way way) const {
    if (groups_[to] == groups_[from]) return way;
    way.push_back(groups_[from]);
    way.erase(std::find(way.begin(), way.end(), groups_[to]), way.end());
    return way;
  }

  /// Returns a button that leads back only now and then: by chance.
  std::optional<ControlNumber> oddBackControl() const {
    std::map<ControlNumber, std::pair<std::size_t, std::size_t>> counts;  // back, all
    std::set<std::pair<GroupIndex, ControlNumber>> seen;
    for (StepIndex i = 0; i < walk_.steps.size(); ++i) {
      for (ControlNumber c = 0; c < presses(i).size(); ++c) {
        if (!isToStep(presses(i)[c]) || !seen.emplace(groups_[i], c).second) continue;
        counts[c].first += back_.contains({groups_[i], c});
        ++counts[c].second;
      }
    }
    for (const auto& [control, count] : counts) {
      if (count.first > 0 && 2 * count.first <= count.second) return control;
    }
    return std::nullopt;
  }

  Walk merged() const {
    std::map<GroupIndex, StepIndex> numbers;
    std::vector<StepIndex> first;  // of each group
    for (StepIndex i = 0; i < walk_.steps.size(); ++i) {
      if (numbers.try_emplace(groups_[i], numbers.size()).second) first.push_back(i);
    }
    Walk result{.steps = {}, .goesBack = true};
    for (const StepIndex from : first) {
      Step step = walk_.steps[from];
      for (ControlNumber c = 0; c < step.presses.size(); ++c) {
        auto& press = step.presses[c];
        const bool isBack = isToStep(press) ? back_.contains({groups_[from], c})
                                            : !press && isDisabledForWantOfAWay(from, c);
        if (isBack) {
          press = Lead{Lead::Kind::back, 0};
        } else if (isToStep(press)) {
          press->step = numbers.at(groups_[press->step]);
        }
      }
      if (isToStep(step.wait)) step.wait.step = numbers.at(groups_[step.wait.step]);
      result.steps.push_back(std::move(step));
    }
    return result;
  }

  /// Whether the button leads back elsewhere, and is disabled where no way leads back.
  bool isDisabledForWantOfAWay(StepIndex step, ControlNumber control) const {
    const auto& seen = behavior_.situations()[walk_.steps[step].situation].controls[control];
    if (!seen.isShown || seen.isEnabled) return false;
    const bool leadsBack = std::any_of(back_.begin(), back_.end(),
                                       [&](const auto& each) { return each.second == control; });
    return leadsBack && std::all_of(ways_.begin(), ways_.end(), [&](const auto& pair) {
             return groups_[pair.first] != groups_[step] || pair.second.empty();
           });
  }

  using LookNumbers = std::vector<double>;

  const Behavior& behavior_;
  const Walk& walk_;
  check::Looks stateless_;
  std::vector<GroupIndex> groups_;  // of each step
  GroupIndex count_ = 0;
  Marks back_;  // the presses of which that is assumed
  std::set<std::pair<StepIndex, Way>> ways_;
};

}  // namespace

Walk withBack(const Behavior& behavior, const Walk& walk) {
  return WayFinder(behavior, walk).run();
}

}  // namespace qz::tools::lift
