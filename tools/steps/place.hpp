// SPDX-License-Identifier: MIT
// Where something is written in a source, and what is wrong there.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

#include "tools/support/failure.hpp"

namespace qz::tools::steps {

/// The byte of the source, from 0, at which something begins.
using Place = std::size_t;

struct Mistake {
  Place place = 0;
  std::string message;  ///< what is wrong, what was expected, and the likeliest name
};

/// Thrown if a source has mistakes. The message is the first one, with its line and column.
class SourceRefused : public Failure {
 public:
  explicit SourceRefused(std::vector<std::string> messages)
      : Failure(ExitStatus::badInput, messages.front()), messages_(std::move(messages)) {}
  /// Returns all of them, in the order of the source.
  const std::vector<std::string>& messages() const { return messages_; }

 private:
  std::vector<std::string> messages_;
};

/// Collects what is wrong with a source, so that its author learns of everything at once.
class Mistakes {
 public:
  void add(Place place, std::string message) { list_.push_back({place, std::move(message)}); }
  bool isEmpty() const { return list_.empty(); }
  /// Throws a SourceRefused if there are mistakes. `text` is the source, `path` its file.
  void throwIfAny(std::string_view path, std::string_view text);

 private:
  std::vector<Mistake> list_;
};

}  // namespace qz::tools::steps
