// SPDX-License-Identifier: MIT
// Runs of lists that would overflow the stack.
#pragma once

#include <algorithm>
#include <cstddef>
#include <vector>

#include "qz/observer.hpp"

namespace qz::tools::check {

/// Thrown out of a list that would run itself without end, or of too many lists inside each other.
struct EndlessRun {};

/// How many lists may run inside each other. A stack mostly has eight megabytes, and a list takes
/// some four kilobytes of it in a build with the address sanitizer.
inline constexpr std::size_t deepestNesting = 1000;

/// Stops an engine with an EndlessRun before its stack overflows.
class EndlessGuard final : public Observer {
 public:
  void listWillRun(const Value& list, const ObjectId&) override {
    const bool isRunning = std::find(running_.begin(), running_.end(), list) != running_.end();
    if ((isRunning && toolkit::asArray(list)) || running_.size() >= deepestNesting) {
      throw EndlessRun();
    }
    running_.push_back(list);
  }
  void listDidRun(const Value&, const ObjectId&) override { running_.pop_back(); }

 private:
  std::vector<Value> running_;
};

}  // namespace qz::tools::check
