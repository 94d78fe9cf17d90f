// SPDX-License-Identifier: MIT
// Baselines: files of the findings that were there before, so that only new ones fail.
#pragma once

#include <map>
#include <string>
#include <vector>

#include "tools/check/finding.hpp"

namespace qz::tools::check {

class Baseline {
 public:
  /// Reads a baseline. Throws a Failure if the file cannot be read, or is not a baseline.
  static Baseline read(const std::string& path);
  /// Returns an empty baseline, which `write` will write to the path.
  static Baseline empty(const std::string& path) { return Baseline(path); }

  /// Removes the findings of a script that the baseline has. Returns how many were removed. A
  /// finding is recognised by its code, list, tag and expectation, even if the lines of the script
  /// have moved. Each entry takes back one finding.
  std::size_t takeBack(const std::string& script, std::vector<Finding>& findings) const;
  /// Replaces the entries of a script by its findings.
  void replace(const std::string& script, const std::vector<Finding>& findings);
  /// Writes the file. Throws a Failure if that is not possible.
  void write() const;

 private:
  /// What a finding is known by.
  struct Entry {
    std::string code;
    std::string list;         // key, or empty
    std::string tag;          // or empty
    std::string expectation;  // or empty
    friend auto operator<=>(const Entry&, const Entry&) = default;
  };
  struct Known {
    std::size_t count = 0;
    std::string message;  // of the first, for readers of the file
  };
  using Entries = std::map<Entry, Known>;

  explicit Baseline(std::string path) : path_(std::move(path)) {}

  static Entry entryOf(const Finding& finding);
  std::string nameOf(const std::string& script) const;

  std::string path_;
  std::map<std::string, Entries> scripts_;  // by the path from the baseline's folder
};

}  // namespace qz::tools::check
