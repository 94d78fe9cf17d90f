// SPDX-License-Identifier: MIT
// Plays two scripts side by side, in the plainest way: a second opinion on whether users can tell
// one from the other.
#pragma once

#include <cstddef>
#include <map>
#include <string>
#include <vector>

#include "tests/check/world.hpp"

namespace qz::naive {

struct StartedScript {
  Script script;
  std::string startKey;
};

/// Makes every move from every pair of situations; each path is replayed from its beginning in two
/// new worlds.
class JointPlay {
 public:
  JointPlay(StartedScript one, StartedScript other, const HostWindow& host,
            std::string resources = "");

  /// Visits at most so many pairs. Returns what differs and after which moves; empty if nothing.
  std::string run(std::size_t mostPairs);
  std::size_t pairs() const { return known_.size(); }

 private:
  using Path = std::vector<Move>;

  std::string arrive(const Path& path);
  std::string words(const Path& path) const;

  StartedScript one_;
  StartedScript other_;
  const HostWindow& host_;
  std::string resources_;
  std::map<std::string, bool> known_;
  std::vector<Path> pending_;
};

}  // namespace qz::naive
