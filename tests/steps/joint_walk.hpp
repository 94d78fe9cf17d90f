// SPDX-License-Identifier: MIT
// Walks through what the interpreter says and what the engine plays, together and everywhere.
#pragma once

#include <map>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "tests/steps/played_source.hpp"

namespace qz::meaning {

/// What a user did from the start.
using Path = std::vector<Move>;

/// Every place of both is visited, and every move made from it; from places to which several moves
/// lead, after a second path too.
class JointWalk {
 public:
  /// `step` is where the source starts.
  JointWalk(const Tour& tour, const PlayableSource& source, const std::string& step);

  /// Walks. Returns what differs and after which path; empty if nothing does.
  std::string run();
  std::size_t places() const { return arrivals_.size(); }
  std::size_t moves() const { return moves_; }

 private:
  struct Arrival {
    State state{};
    std::string kept{};  ///< by the engine
    Path path{};
  };

  std::string makeMove(const Arrival& from, const Move& move);
  std::string arrive(const State& state, const tools::walkthrough::StepPicture& picture,
                     const Path& path);
  std::string compare(const State& state, const tools::walkthrough::StepPicture& picture);
  std::string compareTimers(const State& state, const tools::walkthrough::StepPicture& picture,
                            double passed) const;
  std::string passTime(const State& state, Play& play, double seconds) const;
  void play(Play& play, const Path& path) const;
  std::string words(const Path& path) const;

  const Tour& tour_;
  const PlayableSource& source_;
  const Interpreter meaning_;
  const State start_;
  std::map<std::pair<State, std::string>, int> arrivals_{};  // how often each place was reached
  std::map<std::string, std::string> seenAt_{};              // the steps, except what is the user's
  std::vector<Arrival> pending_{};
  std::size_t moves_ = 0;
};

}  // namespace qz::meaning
