// SPDX-License-Identifier: MIT
// What a long check says meanwhile, and how the user stops it.
#pragma once

#include <chrono>
#include <mutex>
#include <string>

#include "tools/exploration/exploration.hpp"

namespace qz::tools {

/// A line on standard error, if that is a terminal, which is rewritten while the work lasts. It
/// appears after a second, and disappears on destruction. Several threads may show theirs.
class ProgressLine {
 public:
  ProgressLine();
  ~ProgressLine();
  ProgressLine(const ProgressLine&) = delete;
  ProgressLine& operator=(const ProgressLine&) = delete;

  void show(const std::string& script, const check::Progress& progress);
  /// Shows how much of a known number is done, such as "drawing 3 of 20 pictures".
  void show(const std::string& what, std::size_t done, std::size_t all, const std::string& noun);

 private:
  using Clock = std::chrono::steady_clock;

  bool isDue();

  bool isOn_;
  Clock::time_point began_ = Clock::now();
  Clock::time_point shown_{};
  bool isShown_ = false;
  std::mutex mutex_;
};

/// While it lives, the first Ctrl-C only sets `isWanted`; the second one ends the program as usual.
class Interruption {
 public:
  Interruption();
  ~Interruption();
  Interruption(const Interruption&) = delete;
  Interruption& operator=(const Interruption&) = delete;

  static bool isWanted();
};

}  // namespace qz::tools
