// SPDX-License-Identifier: MIT
// What an exploration says is wrong with a script.
#pragma once

#include <algorithm>
#include <compare>
#include <cstddef>
#include <map>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "qz/toolkit/tag.hpp"
#include "tests/check/trace.hpp"

namespace qz::naive {

struct Finding {
  std::string code;
  std::string list;  ///< the key; empty if the finding belongs to no list
  std::optional<std::size_t> element;
  std::optional<toolkit::Tag> tag;
  std::size_t pathLength = 0;  ///< the number of moves, with the start; 0: no path

  friend auto operator<=>(const Finding&, const Finding&) = default;
};

/// Findings without repetition.
class Findings {
 public:
  /// Adds a finding. Of those that differ only in their path, the shortest counts.
  void add(const Finding& finding) {
    Finding cause = finding;
    cause.pathLength = 0;
    const auto [place, isNew] = lengths_.emplace(std::move(cause), finding.pathLength);
    if (!isNew && finding.pathLength < place->second) place->second = finding.pathLength;
  }
  void add(const std::string& code, const Site& site, std::optional<toolkit::Tag> tag,
           std::size_t pathLength) {
    add({code, site.list, site.element, tag, pathLength});
  }

  /// Adds a finding that counts even if another is equal.
  void addAnother(const Finding& finding) { more_.push_back(finding); }

  /// Returns the findings, sorted.
  std::vector<Finding> all() const {
    std::vector<Finding> all = more_;
    for (const auto& [cause, length] : lengths_) {
      all.push_back(cause);
      all.back().pathLength = length;
    }
    std::sort(all.begin(), all.end());
    return all;
  }

 private:
  std::map<Finding, std::size_t> lengths_;  // with paths of the length 0 as keys
  std::vector<Finding> more_;
};

}  // namespace qz::naive
