// SPDX-License-Identifier: MIT
// A situation is a place with a whole look.
#include "tools/comparison/behavior.hpp"

#include <utility>

#include "tools/exploration/flashing.hpp"

namespace qz::tools::comparison {
namespace {

check::Setting exactSetting(const check::Script& script, const Played& played) {
  check::Setting setting = settingOf(script, played.plan, played.resources);
  setting.wholeLooks = true;
  setting.exactStates = true;
  return setting;
}

}  // namespace

class Behavior::Maker {
 public:
  explicit Maker(Behavior& behavior)
      : behavior_(behavior), exploration_(behavior.exploration_), flashing_(exploration_) {}

  void make(unsigned threads) {
    for (const check::Visit& visit : exploration_.visits()) add(visit);
    behavior_.starts_.resize(exploration_.startKeys().size());
    exploration_.makeAllMoves(
        threads, [&](const check::Occasion& occasion, const check::Arrival& arrival, std::uint32_t,
                     std::uint32_t place) { see(occasion, arrival, place); });
  }

 private:
  void add(const check::Visit& visit) {
    const auto number = static_cast<SituationIndex>(behavior_.situations_.size());
    if (!numbers_.try_emplace({visit.place, visit.look}, number).second) return;
    const auto index = static_cast<std::uint32_t>(&visit - exploration_.visits().data());
    behavior_.situations_.push_back(situationAt(visit, index));
  }

  Situation situationAt(const check::Visit& visit, std::uint32_t index) {
    const auto& format = exploration_.format();
    const std::uint8_t* const place = exploration_.place(visit.place);
    Situation situation{.isOver = format.isOver(place), .visit = index};
    if (situation.isOver) return situation;  // the window is closed
    const check::Looks::Parts& parts = exploration_.looks().parts(visit.look);
    situation.background = backgroundOf(parts[format.controls()]);
    for (std::size_t i = 0; i < format.controls(); ++i) {
      const check::ControlState state = format.control(place, i);
      const bool canBePressed = !state.hidden && state.enabled && isButton(i);
      if (canBePressed) situation.moves[static_cast<Move>(i)];
      situation.controls.push_back(
          state.hidden ? Appearance()
                       : Appearance{.isShown = true,
                                    .isEnabled = state.enabled,
                                    .flashes = flashing_.flashes(visit.place, i, parts),
                                    .look = valueOf(parts[i])});
    }
    const auto& timers = exploration_.timers(visit.place);
    if (!timers.empty() && timers.front().seconds != check::neverFires) {
      situation.wait = timers.front().seconds;
      situation.moves[check::waitMove];
    }
    return situation;
  }

  bool isButton(std::size_t control) const {
    return drivers::isButton(exploration_.setting().kinds[control]);
  }

  /// Of the window behind the controls only the image is seen.
  LookValue backgroundOf(LookValue own) {
    check::ViewLook look;
    look.view.layerContents = exploration_.looks().look(own).view.layerContents;
    return behavior_.looks_.valueOf(look);
  }

  LookValue valueOf(LookValue own) {
    const auto [known, isNew] = values_.try_emplace(own);
    if (isNew) known->second = behavior_.looks_.valueOf(exploration_.looks().look(own));
    return known->second;
  }

  void see(const check::Occasion& occasion, const check::Arrival& arrival, std::uint32_t place) {
    const auto found = numbers_.find({place, arrival.look});
    if (found == numbers_.end()) return;  // beyond a limit
    if (occasion.visit == check::noVisit) {
      behavior_.starts_[occasion.move] = found->second;
      return;
    }
    const check::Visit& from = exploration_.visits()[occasion.visit];
    behavior_.situations_[numbers_.at({from.place, from.look})].moves[occasion.move] =
        found->second;
  }

  Behavior& behavior_;
  check::Exploration& exploration_;
  check::Flashing flashing_;
  std::map<std::pair<std::uint32_t, std::uint32_t>, SituationIndex> numbers_;  // by place and look
  std::map<LookValue, LookValue> values_;  // of the behaviour's table, by that of the exploration
};

Behavior::Behavior(Played played, check::Looks& looks, const check::ExplorationLimits& limits,
                   unsigned threads, const check::ExplorationHooks& hooks)
    : played_(std::move(played)),
      script_(played_.script),
      setting_(exactSetting(script_, played_)),
      exploration_(setting_, played_.startKeys),
      looks_(looks) {
  exploration_.run(limits, threads, hooks);
  Maker(*this).make(threads);
}

}  // namespace qz::tools::comparison
