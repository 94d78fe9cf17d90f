// SPDX-License-Identifier: MIT
// Divides the situations into classes until all of a class have moves into the same classes. Then
// finds out what the moves do to the states of buttons.
#include "tools/lift/walk.hpp"

#include <algorithm>
#include <map>
#include <set>
#include <utility>

#include "tools/lift/unsayable.hpp"

namespace qz::tools::lift {
namespace {

using comparison::Move;
using comparison::Situation;
using drivers::ViewKind;
using toolkit::State;

using ClassIndex = std::size_t;

/// What a move may do to a state so that what is seen comes out: any of these.
struct Effects {
  bool keeps = true;
  bool turnsOn = true;
  bool turnsOff = true;

  bool any() const { return keeps || turnsOn || turnsOff; }
  bool onlyKeeps() const { return keeps && !turnsOn && !turnsOff; }
  friend Effects operator&(const Effects& a, const Effects& b) {
    return {a.keeps && b.keeps, a.turnsOn && b.turnsOn, a.turnsOff && b.turnsOff};
  }
};

/// For each control.
using AllEffects = std::vector<Effects>;

State afterClick(ViewKind kind, State state) {
  if (kind == ViewKind::toggle) return state == State::on ? State::off : State::on;
  if (kind != ViewKind::mixed) return state;
  if (state == State::off) return State::mixed;
  return state == State::mixed ? State::on : State::off;
}

class Walker {
 public:
  Walker(const Behavior& behavior, States states)
      : behavior_(behavior),
        all_(behavior.situations()),
        kinds_(behavior.exploration().setting().kinds),
        states_(states) {}

  Walk run() {
    divide();
    findEdges();
    findLiveStates();
    const ClassIndex first = classes_[*behavior_.starts().front()];
    stepFor(first, startEffects());
    for (StepIndex i = 0; i < walk_.steps.size(); ++i) leave(i);
    chooseStates();
    return std::move(walk_);
  }

 private:
  struct Edge {
    ClassIndex to = 0;
    AllEffects effects{};
  };
  struct Variant {
    ClassIndex of = 0;
    AllEffects effects{};
  };

  bool showsState(std::size_t control) const { return drivers::rowOf(kinds_[control]).showsState; }

  State stateOf(SituationIndex situation, std::size_t control) const {
    const auto& exploration = behavior_.exploration();
    const auto& visit = exploration.visits()[all_[situation].visit];
    const auto value = exploration.looks().parts(visit.look)[control];
    return exploration.looks().look(value).view.state;
  }

  /// What a user sees, as numbers.
  std::vector<std::size_t> signatureOf(SituationIndex number) {
    const Situation& situation = all_[number];
    if (situation.isOver) return {};
    std::vector<std::size_t> signature = {
        situation.background,
        situation.wait ? 1 + waits_.try_emplace(*situation.wait, waits_.size()).first->second : 0};
    for (std::size_t i = 0; i < situation.controls.size(); ++i) {
      const auto& seen = situation.controls[i];
      const bool hasState = states_ == States::exact && seen.isShown && showsState(i);
      signature.insert(signature.end(),
                       {seen.isShown, seen.isEnabled, seen.flashes, withoutState(seen).look,
                        hasState ? static_cast<std::size_t>(stateOf(number, i)) : 0});
    }
    return signature;
  }

  comparison::Appearance withoutState(comparison::Appearance seen) const {
    if (seen.isShown) {
      seen.look = stateless_.valueOf({behavior_.looks().look(seen.look).view, true});
    }
    return seen;
  }

  void divide() {
    std::map<std::vector<std::size_t>, ClassIndex> numbers;
    for (SituationIndex i = 0; i < all_.size(); ++i) {
      classes_.push_back(numbers.try_emplace(signatureOf(i), numbers.size()).first->second);
    }
    for (std::size_t count = 0; count != numbers.size();) {
      count = numbers.size();
      numbers.clear();
      std::vector<ClassIndex> divided;
      for (SituationIndex i = 0; i < all_.size(); ++i) {
        std::vector<std::size_t> signature = {classes_[i]};
        for (const auto& [move, to] : all_[i].moves) signature.push_back(classes_[*to]);
        divided.push_back(numbers.try_emplace(signature, numbers.size()).first->second);
      }
      classes_ = std::move(divided);
    }
    members_.resize(numbers.size());
    for (SituationIndex i = 0; i < all_.size(); ++i) members_[classes_[i]].push_back(i);
  }

  const Situation& one(ClassIndex index) const { return all_[members_[index].front()]; }

  /// Narrows down what a move that led from one situation to another can have done.
  void narrow(AllEffects& effects, SituationIndex from, Move move, SituationIndex to) const {
    for (std::size_t i = 0; i < kinds_.size(); ++i) {
      if (!showsState(i)) continue;
      State before = stateOf(from, i);
      if (move == i) before = afterClick(kinds_[i], before);
      const State after = stateOf(to, i);
      effects[i] = effects[i] & Effects{.keeps = before == after,
                                        .turnsOn = after == State::on,
                                        .turnsOff = after == State::off};
    }
  }

  void findEdges() {
    edges_.resize(members_.size());
    for (ClassIndex from = 0; from < members_.size(); ++from) {
      for (const SituationIndex member : members_[from]) {
        for (const auto& [move, to] : all_[member].moves) {
          const auto [edge, isNew] = edges_[from].try_emplace(move);
          if (isNew) edge->second = {classes_[*to], AllEffects(kinds_.size())};
          narrow(edge->second.effects, member, move, *to);
        }
      }
    }
  }

  /// A state is alive if a user sees it now, or later without anything setting it before.
  void findLiveStates() {
    live_.resize(members_.size(), std::vector<bool>(kinds_.size(), false));
    for (bool isNews = true; isNews;) {
      isNews = false;
      for (ClassIndex i = 0; i < members_.size(); ++i) {
        if (one(i).isOver) continue;
        for (std::size_t control = 0; control < kinds_.size(); ++control) {
          if (live_[i][control] || !isAlive(i, control)) continue;
          live_[i][control] = isNews = true;
        }
      }
    }
    for (auto& edges : edges_) {
      for (auto& [move, edge] : edges) forgetDeadStates(edge);
    }
  }

  bool isAlive(ClassIndex index, std::size_t control) const {
    if (!showsState(control)) return false;
    if (one(index).controls[control].isShown) return true;
    if (states_ == States::exact) return false;
    return std::any_of(edges_[index].begin(), edges_[index].end(), [&](const auto& each) {
      const Edge& edge = each.second;
      return edge.effects[control].onlyKeeps() && live_[edge.to][control];
    });
  }

  void forgetDeadStates(Edge& edge) const {
    for (std::size_t i = 0; i < kinds_.size(); ++i) {
      if (!live_[edge.to][i]) edge.effects[i] = {};
    }
  }

  AllEffects startEffects() const {
    const SituationIndex start = *behavior_.starts().front();
    Edge edge{classes_[start], AllEffects(kinds_.size())};
    for (std::size_t i = 0; i < kinds_.size(); ++i) {
      const State before = behavior_.exploration().setting().before[i].state;
      const State after = stateOf(start, i);
      edge.effects[i] = {before == after, after == State::on, after == State::off};
    }
    forgetDeadStates(edge);
    return edge.effects;
  }

  /// Returns the step of the class that does one of these things to the states; a new one if there
  /// is none.
  StepIndex stepFor(ClassIndex of, const AllEffects& effects) {
    if (const auto known = narrowedStep(of, effects)) return *known;
    for (std::size_t i = 0; i < effects.size(); ++i) {
      if (!effects[i].any()) refuseState(of, i);
    }
    variants_.push_back({of, effects});
    walk_.steps.push_back({.situation = members_[of].front(), .seconds = one(of).wait});
    return variants_.size() - 1;
  }

  /// Returns a step of the class that can do one of these things, and from now on does no other.
  std::optional<StepIndex> narrowedStep(ClassIndex of, const AllEffects& effects) {
    for (StepIndex i = 0; i < variants_.size(); ++i) {
      if (variants_[i].of != of) continue;
      const AllEffects both = common(variants_[i].effects, effects);
      if (!isPossible(both)) continue;
      variants_[i].effects = both;
      return i;
    }
    return std::nullopt;
  }

  [[noreturn]] void refuseState(ClassIndex of, std::size_t control) const {
    throw Unsayable(members_[of].front(), control,
                    "no step can give it this state: a step says that a check box is on or off, or "
                    "leaves its state to the user everywhere");
  }

  static AllEffects common(const AllEffects& a, const AllEffects& b) {
    AllEffects both;
    for (std::size_t i = 0; i < a.size(); ++i) both.push_back(a[i] & b[i]);
    return both;
  }
  static bool isPossible(const AllEffects& all) {
    return std::all_of(all.begin(), all.end(), [](const Effects& each) { return each.any(); });
  }
  static bool keepsAll(const AllEffects& all) {
    return std::all_of(all.begin(), all.end(), [](const Effects& each) { return each.keeps; });
  }

  void leave(StepIndex from) {
    const ClassIndex of = variants_[from].of;
    std::vector<std::optional<Lead>> presses(kinds_.size());
    walk_.steps[from].givesUp = twinOf(of).has_value();
    for (const auto& [move, edge] : edges_[of]) {
      const Lead lead = leadAlong(of, move, edge);
      if (move == check::waitMove) {
        walk_.steps[from].wait = lead;
      } else {
        presses[move] = lead;
      }
    }
    walk_.steps[from].presses = std::move(presses);
  }

  Lead leadAlong(ClassIndex from, Move move, const Edge& edge) {
    if (one(edge.to).isOver) return Lead{Lead::Kind::end, 0};
    const bool isPress = move != check::waitMove;
    const auto twin = twinOf(from);
    const bool staysHere = edge.to == twin.value_or(from);
    if (isPress && staysHere && keepsAll(edge.effects)) return Lead{};
    return Lead{Lead::Kind::step, stepFor(edge.to, edge.effects)};
  }

  /// Returns the class that differs from this one only in that the wait is given up, if presses
  /// lead there and none starts the wait again.
  std::optional<ClassIndex> twinOf(ClassIndex of) const {
    if (!one(of).wait) return std::nullopt;
    std::optional<ClassIndex> twin;
    for (const auto& [move, edge] : edges_[of]) {
      if (move == check::waitMove) continue;
      if (edge.to == of) return std::nullopt;
      if (keepsAll(edge.effects) && isTwin(of, edge.to)) twin = edge.to;
    }
    return twin;
  }

  bool isTwin(ClassIndex of, ClassIndex other) const {
    const Situation& here = one(of);
    const Situation& there = one(other);
    if (there.isOver || there.wait || here.background != there.background) return false;
    for (std::size_t i = 0; i < here.controls.size(); ++i) {
      if (withoutState(here.controls[i]) != withoutState(there.controls[i])) return false;
    }
    return std::all_of(edges_[other].begin(), edges_[other].end(), [&](const auto& each) {
      return edges_[of].at(each.first).to == each.second.to;
    });
  }

  /// Chooses what each step does to the states. A step that says nothing leaves a state alone if no
  /// step says it, and makes it the host's otherwise.
  void chooseStates() {
    for (Step& step : walk_.steps) step.states.resize(kinds_.size());
    for (std::size_t i = 0; i < kinds_.size(); ++i) {
      const auto keeps = [&](const Variant& each) { return each.effects[i].keeps; };
      if (std::all_of(variants_.begin(), variants_.end(), keeps)) continue;
      const State host = behavior_.exploration().setting().before[i].state;
      for (StepIndex step = 0; step < variants_.size(); ++step) {
        const Effects& effects = variants_[step].effects[i];
        if (effects.onlyKeeps()) refuseState(variants_[step].of, i);
        const bool isHosts = host == State::on ? effects.turnsOn : effects.turnsOff;
        if (!isHosts || host == State::mixed) {
          walk_.steps[step].states[i] = effects.turnsOn ? State::on : State::off;
        }
      }
    }
  }

  const Behavior& behavior_;
  const std::vector<Situation>& all_;
  const std::vector<ViewKind>& kinds_;
  States states_;
  mutable check::Looks stateless_;  // what controls look like but for their states
  std::map<double, std::size_t> waits_;
  std::vector<ClassIndex> classes_;                   // of each situation
  std::vector<std::vector<SituationIndex>> members_;  // of each class
  std::vector<std::map<Move, Edge>> edges_;           // out of each class
  std::vector<std::vector<bool>> live_;               // states of controls, in each class
  std::vector<Variant> variants_;                     // of which each step is made
  Walk walk_;
};

}  // namespace

Walk walkOf(const Behavior& behavior, States states) { return Walker(behavior, states).run(); }

}  // namespace qz::tools::lift
