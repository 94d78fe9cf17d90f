// SPDX-License-Identifier: MIT
// Allowances: findings that the author of a script accepts.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <utility>
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

/// Removes the findings that are allowed.
void applyAllowances(std::vector<Finding>& findings, const std::vector<Allowance>& allowances);
/// Returns a finding for each allowance of a file that takes none of the findings back.
std::vector<Finding> unneededAllowances(const std::vector<Finding>& findings,
                                        const std::vector<Allowance>& allowances);

/// Scripts in one directory share a file of allowances. Keeps the finding that an allowance is not
/// needed only if none of the scripts needs it, and only at the first of them. `scripts` are the
/// findings by the path of the script.
void mergeUnneeded(const std::vector<std::pair<std::string, std::vector<Finding>*>>& scripts);

}  // namespace qz::tools::check
