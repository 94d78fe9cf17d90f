// SPDX-License-Identifier: MIT
// A pair is two situations that are taken for the same step, changed or not. Pairs lead to pairs by
// the same moves, the nearest first, so that the first path to a change is a shortest one. Where a
// move leads elsewhere, its pair is not followed: what shows the same, or nearly the same, begins
// new pairs of its own, with a path for each of the two.
#include "tools/diff/comparer.hpp"

#include <algorithm>
#include <set>
#include <tuple>
#include <utility>

#include "tools/check/replay.hpp"
#include "tools/check/report.hpp"
#include "tools/diff/step_names.hpp"
#include "tools/play/words.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::diff {
namespace {

using comparison::Move;

/// What does not change while a walk-through is played.
struct WindowFacts {
  explicit WindowFacts(const check::Setting& setting) : title(setting.plan.host.title) {
    const auto picture = check::pictureAfter(setting, {});
    if (picture.window) size = picture.window->content;
    for (const auto& control : picture.controls) frames.push_back(control.view.frame);
  }

  std::string title;
  toolkit::Rect size{};
  std::vector<toolkit::Rect> frames;
};

std::string pairOf(double one, double other, const char* between) {
  return play::numberWords(one) + between + play::numberWords(other);
}

std::string sizeWords(const toolkit::Rect& rect) { return pairOf(rect.width, rect.height, " × "); }

std::string frameWords(const toolkit::Rect& rect) {
  return sizeWords(rect) + " at " + pairOf(rect.x, rect.y, ", ");
}

class PairWalk {
 public:
  PairWalk(const Behaviors& behaviors, const JointControls& controls, std::size_t mostPairs)
      : behaviors_(behaviors),
        controls_(controls),
        mostPairs_(mostPairs),
        faces_(behaviors, controls),
        names_{StepNames(*behaviors.before), StepNames(*behaviors.after)},
        windows_{WindowFacts(settingOf(Side::before)), WindowFacts(settingOf(Side::after))} {
    for (const Side side : bothSides) {
      isPaired_[side].resize(behaviors[side]->situations().size());
    }
    comparison_.isComplete = isAllExplored();
  }

  Comparison run() {
    beginAtStarts();
    followAll();
    while (beginWhereFacesAreEqual() || beginWhereFacesAreNear()) followAll();
    addStepsOfOne();
    std::stable_sort(comparison_.changes.begin(), comparison_.changes.end(), comesFirst);
    return std::move(comparison_);
  }

 private:
  static constexpr std::size_t noPair = static_cast<std::size_t>(-1);

  /// Where the same move leads in each; absent: it runs lists without end.
  using Targets = Both<std::optional<SituationIndex>>;
  using Indices = Both<SituationIndex>;

  /// A pair, and the shortest way to it.
  struct Pair {
    Indices situations;
    std::size_t parent = noPair;
    Move move = 0;              ///< of a joint control, or a wait
    Both<check::Path> begin{};  ///< without a parent
    std::size_t length = 0;     ///< of both paths together
  };

  /// How a pair of targets is reached.
  struct Way {
    std::size_t parent = noPair;
    Move move = 0;  ///< from the parent; without one, the index of the start key
  };

  /// Which pair is nearer. It does not depend on which walk-through is the old one: its length,
  /// whether it has a parent, the number of that or its own among the beginnings, the move.
  using Rank = std::tuple<std::size_t, bool, std::size_t, Move>;

  const check::Setting& settingOf(Side side) const {
    return behaviors_[side]->exploration().setting();
  }
  const Situation& situation(Side side, SituationIndex index) const {
    return behaviors_[side]->situations()[index];
  }
  Both<FaceIndex> facesOf(const Indices& pair) const {
    return {faces_.of(Side::before, pair.before), faces_.of(Side::after, pair.after)};
  }

  void beginAtStarts() {
    const auto& before = behaviors_.before->starts();
    const auto& after = behaviors_.after->starts();
    for (std::size_t i = 0; i < std::min(before.size(), after.size()); ++i) {
      arrive({before[i], after[i]}, {noPair, static_cast<Move>(i)});
    }
  }

  void arrive(const Targets& targets, const Way& way) {
    if (!targets.before && !targets.after) return;
    if (!targets.before || !targets.after) {
      if (isAllExplored()) addMove(targets, way);  // else it may just be unknown
      return;
    }
    const Indices pair{*targets.before, *targets.after};
    const Both<StepName> names = stepsOf(pair);
    if (!faces_.mayBeOneStep(facesOf(pair), names.before.name == names.after.name)) {
      addMove(targets, way);
    } else if (way.parent == noPair) {
      const auto paths = pathsTo(way);
      coming_[{2, false, way.move, 0}] = {pair, noPair, 0, paths, 2};
    } else if (!known_.contains(pair)) {
      const std::size_t length = pairs_[way.parent].length + 2;
      coming_[{length, true, way.parent, way.move}] = {pair, way.parent, way.move, {}, length};
    }
  }

  bool isAllExplored() const {
    return behaviors_.before->isComplete() && behaviors_.after->isComplete();
  }

  void followAll() {
    while (!coming_.empty()) {
      Pair pair = std::move(coming_.begin()->second);
      coming_.erase(coming_.begin());
      if (!known_.insert(pair.situations).second) continue;
      if (pairs_.size() >= mostPairs_) {
        comparison_.isComplete = false;
        continue;
      }
      for (const Side side : bothSides) isPaired_[side][pair.situations[side]] = true;
      pairs_.push_back(std::move(pair));
      follow(pairs_.size() - 1);
    }
  }

  void follow(std::size_t index) {
    const Indices pair = pairs_[index].situations;
    if (faces_.isOver(faces_.of(Side::before, pair.before))) return;
    compareLooks(index, pair);
    compareWaits(index, pair);
    makeMoves(index, pair);
  }

  /// Returns where the moves of a situation lead, by the moves of joint controls.
  std::map<Move, std::optional<SituationIndex>> movesFrom(Side side, SituationIndex index) const {
    std::map<Move, std::optional<SituationIndex>> moves;
    for (const auto& [move, target] : situation(side, index).moves) {
      moves[move == check::waitMove ? move : static_cast<Move>(controls_.of(side, move))] = target;
    }
    return moves;
  }

  /// A press that is possible in one only is a matter of its button's look.
  void makeMoves(std::size_t parent, const Indices& pair) {
    const auto after = movesFrom(Side::after, pair.after);
    for (const auto& [move, target] : movesFrom(Side::before, pair.before)) {
      const auto same = after.find(move);
      if (same != after.end()) arrive({target, same->second}, {parent, move});
    }
  }

  void compareWaits(std::size_t at, const Indices& pair) {
    const Both<std::optional<double>> seconds{situation(Side::before, pair.before).wait,
                                              situation(Side::after, pair.after).wait};
    if (seconds.before == seconds.after) return;
    Change change = changeAt(Change::Kind::wait, at);
    change.seconds = seconds;
    add(std::move(change), pair);
  }

  void compareLooks(std::size_t at, const Indices& pair) {
    for (ControlChange& control : differences(pair)) {
      Change change = changeAt(Change::Kind::look, at);
      change.controls = {std::move(control)};
      add(std::move(change), pair);
    }
  }

  /// Returns what looks different in two situations that are not over.
  std::vector<ControlChange> differences(const Indices& pair) const {
    std::vector<ControlChange> found;
    const auto add = [&](std::optional<std::size_t> control, PropertyChange property) {
      found.push_back({control, std::move(property)});
    };
    if (windows_.before.title != windows_.after.title) {
      add({}, {"title", {quote(windows_.before.title), quote(windows_.after.title)}, true});
    }
    const Both<std::string> sizes{sizeWords(windows_.before.size), sizeWords(windows_.after.size)};
    if (sizes.before != sizes.after) add({}, {"size", sizes, false});
    for (PropertyChange& property : backgroundChanges(pair)) add({}, std::move(property));
    for (std::size_t i = 0; i < controls_.count(); ++i) {
      for (PropertyChange& property : controlChanges(i, pair)) add(i, std::move(property));
    }
    return found;
  }

  std::vector<PropertyChange> backgroundChanges(const Indices& pair) const {
    return looksChanges({situation(Side::before, pair.before).background,
                         situation(Side::after, pair.after).background});
  }

  std::vector<PropertyChange> looksChanges(const Both<comparison::LookValue>& looks) const {
    if (looks.before == looks.after) return {};
    const auto& table = behaviors_.before->looks();
    return propertyChanges(table.look(looks.before).view, table.look(looks.after).view);
  }

  /// Returns the appearance of a joint control; absent if the window does not have it.
  std::optional<Appearance> appearance(Side side, std::size_t joint, const Indices& pair) const {
    const auto control = controls_[joint][side];
    if (!control) return std::nullopt;
    return situation(side, pair[side]).controls[*control];
  }

  std::vector<PropertyChange> controlChanges(std::size_t joint, const Indices& pair) const {
    const auto before = appearance(Side::before, joint, pair);
    const auto after = appearance(Side::after, joint, pair);
    const bool wasShown = before && before->isShown;
    const bool isShown = after && after->isShown;
    if (!wasShown && !isShown) return {};
    if (wasShown != isShown) {
      return {{"shown", {shownWord(before), shownWord(after)}, false}};
    }
    auto changes = looksChanges({before->look, after->look});
    addYesNo("enabled", before->isEnabled, after->isEnabled, changes);
    addYesNo("flashing", before->flashes, after->flashes, changes);
    const Both<std::string> frames{frameOf(Side::before, joint), frameOf(Side::after, joint)};
    if (frames.before != frames.after) changes.push_back({"frame", frames, false});
    return changes;
  }

  std::string frameOf(Side side, std::size_t joint) const {
    return frameWords(windows_[side].frames[*controls_[joint][side]]);
  }

  static std::string shownWord(const std::optional<Appearance>& appearance) {
    if (!appearance) return "no such control";
    return appearance->isShown ? yes : no;
  }

  static void addYesNo(const char* property, bool before, bool after,
                       std::vector<PropertyChange>& changes) {
    if (before == after) return;
    changes.push_back({property, {before ? yes : no, after ? yes : no}, false});
  }

  void addMove(const Targets& targets, const Way& way) {
    Change change{.kind = Change::Kind::move};
    change.isStart = way.parent == noPair;
    if (!change.isStart) {
      change.step = stepsOf(pairs_[way.parent].situations);
      if (way.move != check::waitMove) change.pressed = way.move;
    }
    change.path = pathsTo(way);
    change.at = targets;
    for (const Side side : bothSides) change.target[side] = nameOf(side, targets[side]);
    if (targets.before && targets.after && !isOver(targets)) {
      change.controls = differences({*targets.before, *targets.after});
    }
    const auto from = change.isStart ? Indices() : pairs_[way.parent].situations;
    add(std::move(change), from);
  }

  bool isOver(const Targets& targets) const {
    return situation(Side::before, *targets.before).isOver ||
           situation(Side::after, *targets.after).isOver;
  }

  StepName nameOf(Side side, const std::optional<SituationIndex>& target) const {
    return target ? names_[side].of(*target)
                  : StepName{"lists that run each other without end", ""};
  }

  Both<StepName> stepsOf(const Indices& pair) const {
    return {names_.before.of(pair.before), names_.after.of(pair.after)};
  }

  Change changeAt(Change::Kind kind, std::size_t pair) const {
    Change change{.kind = kind};
    const Indices& situations = pairs_[pair].situations;
    change.step = stepsOf(situations);
    change.path = pathsOf(pair);
    change.at = {situations.before, situations.after};
    return change;
  }

  /// Adds a change, or counts one more step at which one that is there can be seen. Situations of
  /// the same faces are one step.
  void add(Change change, const Indices& seenAt) {
    const Key key(
        change.kind, change.pressed, change.isStart, change.target, change.seconds,
        change.kind == Change::Kind::look ? change.controls : std::vector<ControlChange>());
    const auto [known, isNew] = known_changes_.try_emplace(key, comparison_.changes.size());
    if (isNew) comparison_.changes.push_back(std::move(change));
    auto& steps = steps_[known->second];
    steps.insert(facesOf(seenAt));
    comparison_.changes[known->second].steps = steps.size();
  }

  Both<check::Path> pathsOf(std::size_t pair) const {
    std::vector<Move> moves;
    for (; pairs_[pair].parent != noPair; pair = pairs_[pair].parent) {
      moves.push_back(pairs_[pair].move);
    }
    std::reverse(moves.begin(), moves.end());
    Both<check::Path> paths = pairs_[pair].begin;
    for (const Side side : bothSides) {
      SituationIndex at = pairs_[pair].situations[side];
      for (const Move move : moves) at = *goOn(side, at, move, paths[side]);
    }
    return paths;
  }

  /// Adds a move to a path, and returns where it leads.
  std::optional<SituationIndex> goOn(Side side, SituationIndex at, Move joint,
                                     check::Path& path) const {
    const auto& exploration = behaviors_[side]->exploration();
    const Situation& from = situation(side, at);
    const bool isWait = joint == check::waitMove;
    const Move move = isWait ? joint : static_cast<Move>(*controls_[joint][side]);
    path.push_back(exploration.stepFrom(exploration.visits()[from.visit].place, move));
    return from.moves.at(move);
  }

  Both<check::Path> pathsTo(const Way& way) const {
    Both<check::Path> paths;
    if (way.parent != noPair) paths = pathsOf(way.parent);
    for (const Side side : bothSides) {
      if (way.parent == noPair) {
        paths[side] = {check::StartMove{behaviors_[side]->exploration().startKeys()[way.move]}};
      } else {
        goOn(side, pairs_[way.parent].situations[side], way.move, paths[side]);
      }
    }
    return paths;
  }

  check::Path ownPath(Side side, SituationIndex index) const {
    return behaviors_[side]->exploration().path(situation(side, index).visit);
  }

  /// Begins new pairs, in an order that does not depend on which walk-through is the old one.
  /// Returns NO if there are none.
  bool begin(const std::vector<Indices>& pairs) {
    std::vector<std::pair<std::pair<std::string, std::string>, Pair>> sorted;
    for (const Indices& pair : pairs) {
      if (known_.contains(pair)) continue;
      const Both<check::Path> paths{ownPath(Side::before, pair.before),
                                    ownPath(Side::after, pair.after)};
      const auto words =
          std::minmax({check::playArguments(paths.before), check::playArguments(paths.after)});
      sorted.emplace_back(words,
                          Pair{pair, noPair, 0, paths, paths.before.size() + paths.after.size()});
    }
    std::stable_sort(sorted.begin(), sorted.end(),
                     [](const auto& one, const auto& other) { return one.first < other.first; });
    for (std::size_t i = 0; i < sorted.size(); ++i) {
      const Pair& pair = sorted[i].second;
      coming_[{pair.length, false, i, 0}] = pair;
    }
    return !coming_.empty();
  }

  std::vector<SituationIndex> unpaired(Side side, const std::vector<SituationIndex>& all) const {
    std::vector<SituationIndex> left;
    for (const SituationIndex index : all) {
      if (!isPaired_[side][index]) left.push_back(index);
    }
    return left;
  }

  /// What shows the same in both is compared, however different the ways to it are.
  bool beginWhereFacesAreEqual() {
    std::vector<Indices> pairs;
    for (FaceIndex face = 0; face < faces_.count(); ++face) {
      const auto& all = faces_.situations(face);
      if (faces_.isOver(face) || all.before.empty() || all.after.empty()) continue;
      const Both<std::vector<SituationIndex>> left{unpaired(Side::before, all.before),
                                                   unpaired(Side::after, all.after)};
      for (std::size_t i = 0; i < std::max(left.before.size(), left.after.size()); ++i) {
        pairs.push_back({i < left.before.size() ? left.before[i] : all.before.front(),
                         i < left.after.size() ? left.after[i] : all.after.front()});
      }
    }
    return begin(pairs);
  }

  /// Of the steps that are in one only, those that are most alike, and alike by half, are one step
  /// that has changed.
  bool beginWhereFacesAreNear() {
    constexpr std::size_t most = 1000;  // of each, because each is compared with each
    Both<std::vector<SituationIndex>> left;
    for (const Side side : bothSides) {
      std::vector<SituationIndex> all(isPaired_[side].size());
      for (SituationIndex i = 0; i < all.size(); ++i) all[i] = i;
      left[side] = unpaired(side, all);
      left[side].resize(std::min(left[side].size(), most));
    }
    std::vector<Indices> pairs;
    for (const SituationIndex before : left.before) {
      const auto after = nearest(Side::before, before, left.after);
      if (!after || nearest(Side::after, *after, left.before) != before) continue;
      pairs.push_back({before, *after});
    }
    return begin(pairs);
  }

  std::optional<SituationIndex> nearest(Side side, SituationIndex index,
                                        const std::vector<SituationIndex>& others) const {
    const FaceIndex face = faces_.of(side, index);
    std::size_t least = shownControls(situation(side, index)) / 2 + 1;
    std::optional<SituationIndex> best;
    for (const SituationIndex other : others) {
      const std::size_t distance = faces_.distance(face, faces_.of(otherThan(side), other));
      if (distance >= least) continue;
      least = distance;
      best = other;
    }
    return best;
  }

  static std::size_t shownControls(const Situation& situation) {
    return static_cast<std::size_t>(
        std::count_if(situation.controls.begin(), situation.controls.end(),
                      [](const Appearance& control) { return control.isShown; }));
  }

  /// What was in no pair is in one of the walk-throughs only.
  void addStepsOfOne() {
    for (const Side side : bothSides) {
      for (SituationIndex i = 0; i < isPaired_[side].size(); ++i) {
        if (!isPaired_[side][i] && !situation(side, i).isOver) addStepOfOne(side, i);
      }
    }
  }

  void addStepOfOne(Side side, SituationIndex index) {
    if (!behaviors_[otherThan(side)]->isComplete()) return;
    const bool isNew = side == Side::after;
    Change change{.kind = isNew ? Change::Kind::newStep : Change::Kind::goneStep};
    change.step[side] = change.target[side] = names_[side].of(index);
    change.path[side] = ownPath(side, index);
    change.at[side] = index;
    Indices seenAt;
    seenAt[side] = index;
    add(std::move(change), seenAt);
  }

  static bool comesFirst(const Change& one, const Change& other) {
    const auto length = [](const Change& change) {
      return std::max(change.path.before.size(), change.path.after.size());
    };
    return std::pair(one.kind, length(one)) < std::pair(other.kind, length(other));
  }

  using Key = std::tuple<Change::Kind, std::optional<std::size_t>, bool, Both<StepName>,
                         Both<std::optional<double>>, std::vector<ControlChange>>;

  const Behaviors& behaviors_;
  const JointControls& controls_;
  std::size_t mostPairs_;
  Faces faces_;
  Both<StepNames> names_;
  Both<WindowFacts> windows_;
  std::vector<Pair> pairs_;
  std::map<Rank, Pair> coming_;  // to be followed
  std::set<Indices> known_;
  Both<std::vector<bool>> isPaired_;
  Comparison comparison_;
  std::map<Key, std::size_t> known_changes_;
  std::map<std::size_t, std::set<Both<FaceIndex>>> steps_;  // at which a change can be seen
};

}  // namespace

Comparison compare(const Behaviors& behaviors, const JointControls& controls,
                   std::size_t mostPairs) {
  return PairWalk(behaviors, controls, mostPairs).run();
}

std::string nameOf(Change::Kind kind) {
  switch (kind) {
    case Change::Kind::goneStep:
      return "gone-step";
    case Change::Kind::newStep:
      return "new-step";
    case Change::Kind::move:
      return "move";
    case Change::Kind::wait:
      return "wait";
    case Change::Kind::look:
      break;
  }
  return "look";
}

}  // namespace qz::tools::diff
