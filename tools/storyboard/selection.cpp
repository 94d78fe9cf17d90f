// SPDX-License-Identifier: MIT
#include "tools/storyboard/selection.hpp"

#include <numeric>
#include <set>
#include <utility>

namespace qz::tools::storyboard {
namespace {

class Selection {
 public:
  Selection(const std::vector<BoardStep>& steps, std::size_t most) : steps_(steps), most_(most) {}

  /// Selects the steps at which `isNews` is true; it is called once for each, nearest first.
  template <class IsNews>
  void selectIf(IsNews isNews) {
    for (StepIndex i = 0; i < steps_.size(); ++i) {
      if (isNews(steps_[i]) && selected_.size() < most_) selected_.insert(i);
    }
  }

  std::vector<StepIndex> steps() const { return {selected_.begin(), selected_.end()}; }

 private:
  const std::vector<BoardStep>& steps_;
  std::size_t most_;
  std::set<StepIndex> selected_;
};

}  // namespace

std::vector<StepIndex> selectSteps(const Board& board, std::size_t most) {
  const auto& steps = board.steps();
  std::set<std::uint32_t> lists;
  std::set<std::pair<std::uint32_t, check::Move>> moves;
  std::set<std::pair<std::uint32_t, std::uint32_t>> looks;
  Selection selection(steps, most);
  selection.selectIf([&](const BoardStep& step) { return lists.insert(step.list).second; });
  selection.selectIf([&](const BoardStep& step) {
    bool isNews = false;
    for (const BoardMove& each : step.moves) isNews |= moves.insert({step.list, each.move}).second;
    return isNews;
  });
  selection.selectIf([&](const BoardStep& step) {
    return looks.insert({step.list, step.look}).second;
  });
  selection.selectIf([](const BoardStep&) { return true; });
  return selection.steps();
}

}  // namespace qz::tools::storyboard
