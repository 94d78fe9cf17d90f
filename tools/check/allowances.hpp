// SPDX-License-Identifier: MIT
// Allowances: findings that the author of a script accepts.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "tools/check/finding.hpp"

namespace qz::tools::check {

/// Takes back the findings of a code: all, or those of one list or tag.
struct Allowance {
  std::string code;
  std::optional<std::string> key;   ///< of the list; or the tag, for findings without a list
  std::optional<FileLine> place{};  ///< absent for one from the command line
};

/// Reads `CODE` or `CODE=KEY`. Throws a Failure, which begins with `source`, if no code is called
/// so.
Allowance parseAllowance(std::string_view text, const std::string& source);

/// Reads a file of allowances: one on a line, with comments that begin with `#`.
std::vector<Allowance> readAllowances(const std::string& path);

/// Removes the findings that are allowed. Adds a finding for each allowance of a file that no
/// finding needs.
void applyAllowances(std::vector<Finding>& findings, const std::vector<Allowance>& allowances);

}  // namespace qz::tools::check
