// SPDX-License-Identifier: MIT
// A user who makes any move, for tests that explorers know every place.
#pragma once

#include <cstdint>
#include <memory>
#include <random>
#include <string>

#include "tests/check/world.hpp"

namespace qz::naive {

/// Walks through one living world by random moves. When no move is left, it starts again in a new
/// world. The same seed walks the same way on every platform.
class RandomWalk {
 public:
  /// `host` must outlive this. An empty start key is the smallest tag. `resources` is the directory
  /// of the images; if it is empty, the toolkit's own.
  RandomWalk(Script script, const HostWindow& host, std::string startKey, std::uint64_t seed,
             std::string resources = "");

  /// Makes a move, the first time the start, and returns the place that it leads to; empty if the
  /// move never ended, because lists ran each other endlessly. The next move is then a start.
  std::string next();

 private:
  Script script_;
  const HostWindow& host_;
  std::string startKey_;
  std::string resources_;
  std::mt19937_64 random_;
  std::unique_ptr<World> world_;
};

}  // namespace qz::naive
