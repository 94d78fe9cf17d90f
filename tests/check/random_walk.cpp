// SPDX-License-Identifier: MIT
// A user who makes any move.
#include "tests/check/random_walk.hpp"

#include <utility>

namespace qz::naive {

RandomWalk::RandomWalk(Script script, const HostWindow& host, std::string startKey,
                       std::uint64_t seed, std::string resources)
    : script_(std::move(script)),
      host_(host),
      startKey_(std::move(startKey)),
      resources_(std::move(resources)),
      random_(seed) {}

std::string RandomWalk::next() {
  Move move{.kind = Move::Kind::start, .key = startKey_};
  const auto moves = world_ ? world_->moves() : std::vector<Move>();
  if (moves.empty()) {
    world_ = std::make_unique<World>(script_, host_, resources_);
  } else {
    move = moves[random_() % moves.size()];
  }
  if (world_->perform(move).endless) {
    world_.reset();
    return "";
  }
  return world_->place();
}

}  // namespace qz::naive
