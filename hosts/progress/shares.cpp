// SPDX-License-Identifier: MIT
// Goes back from the ends, breadth first.

#include "hosts/progress/shares.hpp"

#include <algorithm>
#include <cstdint>
#include <limits>

namespace qz::hosts::progress {

using tools::check::Exploration;

namespace {

constexpr auto far = std::numeric_limits<std::size_t>::max();

using Places = std::vector<std::uint32_t>;

/// The moves of an exploration, from their ends.
class Backwards {
 public:
  explicit Backwards(const Exploration& exploration) : sources_(exploration.places()) {
    for (std::uint32_t place = 0; place < exploration.places(); ++place) {
      for (const std::uint32_t target : exploration.successors(place)) {
        sources_[target].push_back(place);
      }
    }
  }

  /// Returns for each place how many moves lead from there to the nearest of `ends`.
  std::vector<std::size_t> distancesTo(Places ends) const {
    std::vector<std::size_t> distances(sources_.size(), far);
    for (const std::uint32_t end : ends) distances[end] = 0;
    for (std::size_t next = 0; next < ends.size(); ++next) {
      for (const std::uint32_t source : sources_[ends[next]]) {
        if (distances[source] != far) continue;
        distances[source] = distances[ends[next]] + 1;
        ends.push_back(source);
      }
    }
    return distances;
  }

 private:
  std::vector<Places> sources_;
};

template <class Condition>
Places placesThat(const Exploration& exploration, Condition condition) {
  Places places;
  for (std::uint32_t place = 0; place < exploration.places(); ++place) {
    if (condition(place)) places.push_back(place);
  }
  return places;
}

WindowOutline outlineOf(const Exploration& exploration, std::uint32_t place) {
  WindowOutline outline;
  const auto& format = exploration.format();
  for (std::size_t i = 0; i < format.controls(); ++i) {
    const auto state = format.control(exploration.place(place), i);
    outline.controls.push_back(
        {.tag = state.tag, .isHidden = state.hidden, .isEnabled = state.enabled});
  }
  for (const auto& timer : exploration.timers(place)) outline.timers.push_back(timer.key);
  return outline;
}

}  // namespace

// The kinds of the controls do not change, nor does their number.
std::string signatureOf(const WindowOutline& window) {
  std::string signature;
  for (const ControlOutline& control : window.controls) {
    signature += std::to_string(control.tag);
    signature += control.isHidden ? "h" : "";
    signature += control.isEnabled ? "," : "d,";
  }
  std::vector<std::string> timers = window.timers;
  std::sort(timers.begin(), timers.end());
  for (const std::string& key : timers) signature += "t" + key;
  return signature;
}

// The end is left out: it can look like the beginning, because it restores the tags.
// A way over a place whose moves were not made is at least one move longer than the way to it.
Shares sharesOf(const Exploration& exploration) {
  Shares shares;
  if (exploration.visits().empty()) return shares;
  const Backwards backwards(exploration);
  const auto isOver = [&](std::uint32_t place) {
    return exploration.format().isOver(exploration.place(place));
  };
  const auto ways = backwards.distancesTo(placesThat(exploration, isOver));
  const auto unknown = backwards.distancesTo(placesThat(exploration, [&](std::uint32_t place) {
    return !exploration.isExpanded(place) && !isOver(place);
  }));
  const std::size_t whole = ways[exploration.visits().front().place];
  if (whole == far || whole == 0) return shares;
  for (std::uint32_t place = 0; place < exploration.places(); ++place) {
    if (isOver(place) || ways[place] == far || ways[place] > unknown[place]) continue;
    const double left = static_cast<double>(ways[place]) / static_cast<double>(whole);
    double& share = shares[signatureOf(outlineOf(exploration, place))];
    share = std::max(share, 1 - left);
  }
  return shares;
}

}  // namespace qz::hosts::progress
