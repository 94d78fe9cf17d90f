// SPDX-License-Identifier: MIT
// Breadth first, so that the first path to a difference is a shortest one.
#include "tools/comparison/comparison.hpp"

#include <algorithm>
#include <map>
#include <sstream>
#include <utility>

#include "tools/check/look_words.hpp"

namespace qz::tools::comparison {
namespace {

class Comparer {
 public:
  Comparer(const Behavior& before, const Behavior& after, std::size_t most)
      : before_(before), after_(after), most_(most) {}

  std::vector<Difference> run() {
    meet({before_.starts().front(), after_.starts().front()}, noPair, 0);
    for (std::size_t i = 0; i < pairs_.size() && found_.size() < most_; ++i) follow(i);
    return std::move(found_);
  }

 private:
  using Both = std::pair<std::optional<SituationIndex>, std::optional<SituationIndex>>;

  /// A pair of situations, and the move by which it was found first.
  struct Pair {
    SituationIndex before;
    SituationIndex after;
    std::size_t parent;
    Move move;
  };
  static constexpr std::size_t noPair = static_cast<std::size_t>(-1);

  void meet(const Both& both, std::size_t parent, Move move) {
    const auto& [before, after] = both;
    if (!before && !after) return;
    if (!known_.try_emplace(both, true).second) return;
    Difference difference{.before = before, .after = after};
    if (!before || !after) {
      difference.kind = Difference::Kind::hang;
      difference.words = before ? "now it runs lists without end" : "it ran lists without end";
    } else if (!tell(before_.situations()[*before], after_.situations()[*after], difference)) {
      pairs_.push_back({*before, *after, parent, move});
      return;
    }
    if (parent != noPair) {
      difference.path = pathTo(parent);
      difference.path.push_back(move);
    }
    found_.push_back(std::move(difference));
  }

  /// The same moves are possible at both: what can be pressed is a part of the look.
  void follow(std::size_t index) {
    const Pair pair = pairs_[index];
    const auto& after = after_.situations()[pair.after].moves;
    for (const auto& [move, target] : before_.situations()[pair.before].moves) {
      meet({target, after.at(move)}, index, move);
    }
  }

  std::vector<Move> pathTo(std::size_t pair) const {
    std::vector<Move> path;
    for (; pairs_[pair].parent != noPair; pair = pairs_[pair].parent) {
      path.push_back(pairs_[pair].move);
    }
    std::reverse(path.begin(), path.end());
    return path;
  }

  /// Returns NO if nothing differs.
  bool tell(const Situation& before, const Situation& after, Difference& difference) const {
    if (before.isOver != after.isOver) {
      difference.kind = Difference::Kind::end;
      difference.words = after.isOver ? "the walk-through has ended" : "the walk-through goes on";
      return true;
    }
    for (std::size_t i = 0; i < before.controls.size(); ++i) {
      if (before.controls[i] == after.controls[i]) continue;
      difference.control = i;
      difference.words = wordsFor(before.controls[i], after.controls[i]);
      return true;
    }
    if (before.background != after.background) {
      difference.words = lookWords(before.background, after.background);
      return true;
    }
    difference.kind = Difference::Kind::wait;
    difference.words = waitWords(after.wait) + " instead of " + waitWords(before.wait);
    return before.wait != after.wait;
  }

  std::string wordsFor(const Appearance& before, const Appearance& after) const {
    if (before.isShown != after.isShown) return after.isShown ? "shown" : "hidden";
    if (before.isEnabled != after.isEnabled) return after.isEnabled ? "enabled" : "disabled";
    if (before.flashes != after.flashes) return after.flashes ? "flashes" : "does not flash";
    return lookWords(before.look, after.look);
  }

  std::string lookWords(LookValue before, LookValue after) const {
    const auto words =
        check::wordsFor(before_.looks().look(before).view, after_.looks().look(after).view);
    return words.empty() ? "another look" : words.front().instead;
  }

  const Behavior& before_;
  const Behavior& after_;
  std::size_t most_;
  std::vector<Pair> pairs_;
  std::map<Both, bool> known_;
  std::vector<Difference> found_;
};

}  // namespace

std::string waitWords(const std::optional<double>& seconds) {
  if (!seconds) return "no wait";
  std::ostringstream out;
  out << "a wait of " << *seconds << " s";
  return out.str();
}

std::vector<Difference> compare(const Behavior& before, const Behavior& after, std::size_t most) {
  return Comparer(before, after, most).run();
}

check::Path pathIn(const Behavior& behavior, const std::vector<Move>& moves) {
  const auto& exploration = behavior.exploration();
  check::Path path = {check::StartMove{exploration.startKeys().front()}};
  auto at = behavior.starts().front();
  for (const Move move : moves) {
    if (!at) break;
    const Situation& situation = behavior.situations()[*at];
    path.push_back(exploration.stepFrom(exploration.visits()[situation.visit].place, move));
    at = situation.moves.at(move);
  }
  return path;
}

}  // namespace qz::tools::comparison
