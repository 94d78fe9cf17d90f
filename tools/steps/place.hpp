// SPDX-License-Identifier: MIT
// Where something is written in a source, and what is wrong there.
#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "tools/support/failure.hpp"

namespace qz::tools::steps {

class SourceFiles;

/// The byte at which something begins, from 0. The bytes of included files count on from those of
/// the source.
using Place = std::size_t;

struct Mistake {
  Place place = 0;
  std::string message;  ///< what is wrong, what was expected, and the likeliest name
};

/// Thrown if a source has mistakes. The message is the first one, with its file, line and column.
class SourceRefused : public Failure {
 public:
  SourceRefused(std::vector<std::string> messages, std::vector<std::string> paths)
      : Failure(ExitStatus::badInput, messages.front()),
        messages_(std::move(messages)),
        paths_(std::move(paths)) {}
  /// Returns all of them, in the order of the source.
  const std::vector<std::string>& messages() const { return messages_; }
  /// Returns the paths of the source and of all files that it includes.
  const std::vector<std::string>& paths() const { return paths_; }

 private:
  std::vector<std::string> messages_;
  std::vector<std::string> paths_;
};

/// Collects what is wrong with a source, so that its author learns of everything at once.
class Mistakes {
 public:
  void add(Place place, std::string message) { list_.push_back({place, std::move(message)}); }
  bool isEmpty() const { return list_.empty(); }
  /// Throws a SourceRefused if there are mistakes in these files.
  void throwIfAny(const SourceFiles& files);

 private:
  std::vector<Mistake> list_;
};

}  // namespace qz::tools::steps
