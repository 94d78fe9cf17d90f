// SPDX-License-Identifier: MIT
// Plays two scripts side by side, in the plainest way: a second opinion on whether users can tell
// one from the other.
#pragma once

#include <cstddef>
#include <optional>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "tests/check/world.hpp"

namespace qz::naive {

struct StartedScript {
  Script script;
  std::string startKey;
};

/// The nearest difference that a user notices.
struct JointDifference {
  std::string words{};    ///< for failing tests
  std::size_t moves = 0;  ///< after the start
  /// The controls that look different, each with a property: "shown", "enabled", "flashing",
  /// "caption", "image", "tooltip", "background" or "state".
  std::set<std::pair<std::size_t, std::string>> controls{};
};

/// Makes every move from every pair of situations; each path is replayed from its beginning in two
/// new worlds.
class JointPlay {
 public:
  JointPlay(StartedScript one, StartedScript other, const HostWindow& host,
            std::string resources = "");

  /// Visits at most so many pairs, the nearest first. Returns what differs first; absent if nothing
  /// does.
  std::optional<JointDifference> run(std::size_t mostPairs);
  std::size_t pairs() const { return known_.size(); }

 private:
  using Path = std::vector<Move>;

  std::optional<JointDifference> arrive(const Path& path);
  std::string words(const Path& path) const;

  StartedScript one_;
  StartedScript other_;
  const HostWindow& host_;
  std::string resources_;
  std::set<std::string> known_;
  std::vector<Path> pending_;
};

}  // namespace qz::naive
