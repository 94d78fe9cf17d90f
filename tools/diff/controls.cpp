// SPDX-License-Identifier: MIT
#include "tools/diff/controls.hpp"

#include <algorithm>
#include <map>
#include <tuple>

#include "tools/support/text_layout.hpp"

namespace qz::tools::diff {
namespace {

constexpr std::size_t unmatched = static_cast<std::size_t>(-1);

std::string captionOf(const check::Setting& setting, std::size_t control) {
  const auto& view = setting.before[control];
  return drivers::isButton(setting.kinds[control]) ? view.title.string() : view.text.string();
}

/// Returns by what a control is known in each round; empty if it is not.
std::string keyOf(const check::Setting& setting, std::size_t control, int round) {
  if (round == 0) return factsOf(setting, control).name;
  return round == 1 ? std::to_string(setting.ownTags[control]) : captionOf(setting, control);
}

class Matcher {
 public:
  Matcher(const check::Setting& before, const check::Setting& after)
      : before_(before),
        after_(after),
        ofBefore_(before.kinds.size(), unmatched),
        isMatched_(after.kinds.size()) {}

  std::vector<JointControl> match() {
    for (const int round : {0, 1, 2}) matchIn(round);
    std::vector<JointControl> controls;
    for (std::size_t i = 0; i < ofBefore_.size(); ++i) {
      const bool isThere = ofBefore_[i] != unmatched;
      controls.push_back({i, isThere ? std::optional(ofBefore_[i]) : std::nullopt});
    }
    for (std::size_t i = 0; i < isMatched_.size(); ++i) {
      if (!isMatched_[i]) controls.push_back({std::nullopt, i});
    }
    std::stable_sort(controls.begin(), controls.end(), isFartherBack);
    return controls;
  }

 private:
  /// The order is the same if the windows are swapped.
  static bool isFartherBack(const JointControl& one, const JointControl& other) {
    const auto rank = [](const JointControl& control) {
      const auto [before, after] = control;
      return std::pair(std::min(before.value_or(unmatched), after.value_or(unmatched)),
                       std::max(before.value_or(unmatched), after.value_or(unmatched)));
    };
    return rank(one) < rank(other);
  }

  /// The first one with a key is the first one with that key in the other window, and so on.
  void matchIn(int round) {
    std::map<std::pair<drivers::ViewKind, std::string>, std::vector<std::size_t>> free;
    for (std::size_t i = after_.kinds.size(); i-- > 0;) {
      if (!isMatched_[i]) free[{after_.kinds[i], keyOf(after_, i, round)}].push_back(i);
    }
    for (std::size_t i = 0; i < ofBefore_.size(); ++i) {
      const std::string key = keyOf(before_, i, round);
      if (ofBefore_[i] != unmatched || key.empty()) continue;
      auto& candidates = free[{before_.kinds[i], key}];
      if (candidates.empty()) continue;
      ofBefore_[i] = candidates.back();
      isMatched_[candidates.back()] = true;
      candidates.pop_back();
    }
  }

  const check::Setting& before_;
  const check::Setting& after_;
  std::vector<std::size_t> ofBefore_;  // the control of the other window
  std::vector<bool> isMatched_;
};

}  // namespace

JointControls::JointControls(const check::Setting& before, const check::Setting& after)
    : controls_(Matcher(before, after).match()),
      numbers_{std::vector<std::size_t>(before.kinds.size()),
               std::vector<std::size_t>(after.kinds.size())} {
  for (std::size_t i = 0; i < controls_.size(); ++i) {
    for (const Side side : bothSides) {
      if (const auto control = controls_[i][side]) numbers_[side][*control] = i;
    }
  }
}

std::string ControlFacts::words() const {
  return name.empty() ? std::string(drivers::rowOf(kind).word) + " " + std::to_string(tag)
                      : oneLine(name);
}

ControlFacts factsOf(const check::Setting& setting, std::size_t control) {
  const toolkit::Tag tag = setting.ownTags[control];
  const auto& names = setting.plan.names.controls;
  const auto name = names.find(tag);
  return {name == names.end() ? "" : name->second, tag, setting.kinds[control]};
}

}  // namespace qz::tools::diff
