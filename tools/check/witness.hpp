// SPDX-License-Identifier: MIT
// Writes findings as scenarios, which everybody can replay on every toolkit.
#pragma once

#include <cstddef>
#include <map>
#include <set>
#include <string>

#include "tools/check/check.hpp"

namespace qz::tools::check {

/// Writes the files of one run: CODE-N.walk for each finding with a path.
class WitnessWriter {
 public:
  /// Makes the directory if there is none. Throws a Failure if that is not possible.
  explicit WitnessWriter(std::string directory);

  /// Writes the scenarios of a script's findings. Throws a Failure if a file cannot be written.
  void write(const Verdict& verdict, const InputFile& file, const CheckOptions& options);

  std::size_t count() const { return count_; }

 private:
  std::string directory_;
  std::map<std::string, std::size_t> numbers_;  // by code
  std::size_t count_ = 0;
};

}  // namespace qz::tools::check
