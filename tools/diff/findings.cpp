// SPDX-License-Identifier: MIT
#include "tools/diff/findings.hpp"

#include <map>
#include <string>

namespace qz::tools::diff {
namespace {

using check::Finding;

std::string codeAndWords(const Finding& finding) { return finding.code + " " + finding.message; }

std::string codeAndTag(const Finding& finding) {
  return finding.code + " " + (finding.tag ? std::to_string(*finding.tag) : "");
}

/// Takes away as many findings of each key as the other walk-through has.
void removeCommon(Both<std::vector<Finding>>& findings, std::string (*keyOf)(const Finding&)) {
  Both<std::map<std::string, std::size_t>> counts;
  for (const Side side : bothSides) {
    for (const Finding& finding : findings[side]) ++counts[side][keyOf(finding)];
  }
  for (const Side side : bothSides) {
    auto others = counts[otherThan(side)];
    std::erase_if(findings[side], [&](const Finding& finding) {
      std::size_t& count = others[keyOf(finding)];
      return count > 0 && count-- > 0;
    });
  }
}

}  // namespace

Both<std::vector<Finding>> findingsOfOne(const Both<std::vector<Finding>>& all) {
  Both<std::vector<Finding>> left = all;
  removeCommon(left, codeAndWords);
  removeCommon(left, codeAndTag);
  return left;
}

}  // namespace qz::tools::diff
