// SPDX-License-Identifier: MIT
// The log of a scenario: every line, and how many of them were expected so far.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace qz::tools::scenario {

class LogRecord {
 public:
  struct Entry {
    std::string text;
    int statementLine;  ///< of the statement during which it was logged
  };

  void add(std::string_view text) { entries_.push_back({std::string(text), statementLine}); }

  /// Returns the first entry that was not yet expected; null if there is none.
  const Entry* next() const { return expected_ < entries_.size() ? &entries_[expected_] : nullptr; }
  std::size_t left() const { return entries_.size() - expected_; }
  void expectNext() { ++expected_; }
  void ignoreAll() { expected_ = entries_.size(); }

  /// The line of the statement that is being performed.
  int statementLine = 0;

 private:
  std::vector<Entry> entries_;
  std::size_t expected_ = 0;
};

}  // namespace qz::tools::scenario
