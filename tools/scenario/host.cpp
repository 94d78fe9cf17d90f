// SPDX-License-Identifier: MIT
// The host of a scenario.

#include "tools/scenario/host.hpp"

#include <algorithm>
#include <iterator>

#include "qz/toolkit/window.hpp"

namespace qz::tools::scenario {

bool HostResponder::tryToPerform(std::string_view name, const toolkit::Ref<toolkit::View>& sender) {
  if (name != action) return false;
  performed_(sender);
  return true;
}

void SheetRecorder::sheetDidEnd(const toolkit::Ref<toolkit::Window>& sheet, long returnCode,
                                void*) {
  returnCodes_.push_back(returnCode);
  sheet->orderOut();
  ended_();
}

std::vector<Reactions::Reaction> Reactions::take(const Event& event) {
  const auto taken =
      std::stable_partition(waiting_.begin(), waiting_.end(),
                            [&](const Reaction& reaction) { return !reaction.isFor(event); });
  std::vector<Reaction> reactions(std::make_move_iterator(taken),
                                  std::make_move_iterator(waiting_.end()));
  waiting_.erase(taken, waiting_.end());
  return reactions;
}

}  // namespace qz::tools::scenario
