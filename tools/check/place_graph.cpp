// SPDX-License-Identifier: MIT
// Tarjan's algorithm for strongly connected components, with a stack of its own instead of
// recursion: a walk-through can be longer than the program's stack.
#include "tools/check/place_graph.hpp"

#include <algorithm>

namespace qz::tools::check {
namespace {

constexpr std::uint32_t notSeen = 0xffffffff;

class CircleFinder {
 public:
  explicit CircleFinder(const Exploration& exploration)
      : exploration_(exploration),
        order_(exploration.places(), notSeen),
        lowest_(exploration.places()),
        circleOf_(exploration.places(), notSeen) {}

  std::vector<PlaceCircle> circles() {
    for (std::uint32_t place = 0; place < order_.size(); ++place) {
      if (order_[place] == notSeen) search(place);
    }
    return std::move(circles_);
  }

 private:
  // Not with the targets themselves: the stack can be as deep as there are places.
  struct Frame {
    std::uint32_t place;
    std::uint32_t next = 0;
  };

  void enter(std::uint32_t place) {
    order_[place] = lowest_[place] = entered_++;
    open_.push_back(place);
    frames_.push_back({place});
  }

  void search(std::uint32_t root) {
    enter(root);
    while (!frames_.empty()) {
      Frame& frame = frames_.back();
      if (frame.next < exploration_.successorCount(frame.place)) {
        follow(frame.place, exploration_.successor(frame.place, frame.next++));
      } else {
        leave();
      }
    }
  }

  void follow(std::uint32_t place, std::uint32_t target) {
    if (order_[target] == notSeen) {
      enter(target);
    } else if (circleOf_[target] == notSeen) {
      lowest_[place] = std::min(lowest_[place], order_[target]);
    }
  }

  void leave() {
    const std::uint32_t place = frames_.back().place;
    frames_.pop_back();
    if (!frames_.empty()) {
      std::uint32_t& above = lowest_[frames_.back().place];
      above = std::min(above, lowest_[place]);
    }
    if (lowest_[place] == order_[place]) close(place);
  }

  void close(std::uint32_t root) {
    const auto number = static_cast<std::uint32_t>(circles_.size());
    PlaceCircle circle;
    circle.places = takePlaces(root, number);
    for (const std::uint32_t each : circle.places) describe(circle, each, number);
    circles_.push_back(std::move(circle));
  }

  /// Takes the open places down to the root, as those of the circle with this number.
  std::vector<std::uint32_t> takePlaces(std::uint32_t root, std::uint32_t number) {
    std::vector<std::uint32_t> places;
    do {
      places.push_back(open_.back());
      circleOf_[open_.back()] = number;
      open_.pop_back();
    } while (places.back() != root);
    std::sort(places.begin(), places.end());
    return places;
  }

  void describe(PlaceCircle& circle, std::uint32_t place, std::uint32_t number) {
    circle.isEnd |= exploration_.format().isOver(exploration_.place(place));
    circle.reachesEnd |= circle.isEnd;
    circle.reachesList |= exploration_.canRunList(place);
    const std::size_t count = exploration_.successorCount(place);
    for (std::size_t i = 0; i < count; ++i) {
      const std::uint32_t target = exploration_.successor(place, i);
      if (circleOf_[target] != number) leadTo(circles_[circleOf_[target]], circle);
    }
  }

  /// Notes that a way leads from a circle to the next.
  static void leadTo(const PlaceCircle& next, PlaceCircle& circle) {
    circle.isLast = false;
    circle.reachesEnd |= next.reachesEnd;
    circle.reachesList |= next.reachesList;
  }

  const Exploration& exploration_;
  std::uint32_t entered_ = 0;
  std::vector<std::uint32_t> order_;
  std::vector<std::uint32_t> lowest_;
  std::vector<std::uint32_t> circleOf_;
  std::vector<std::uint32_t> open_;
  std::vector<Frame> frames_;
  std::vector<PlaceCircle> circles_;
};

}  // namespace

std::vector<PlaceCircle> circlesOf(const Exploration& exploration) {
  return CircleFinder(exploration).circles();
}

}  // namespace qz::tools::check
