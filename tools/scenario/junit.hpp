// SPDX-License-Identifier: MIT
// Reports in the XML that continuous-integration services read (JUnit's).
#pragma once

#include <string>
#include <vector>

#include "tools/scenario/runner.hpp"

namespace qz::tools::scenario {

/// Returns one test suite per file, in the order of the reports, with one test case per scenario.
/// Characters that XML does not allow become U+FFFD.
std::string junitReport(const std::vector<Report>& reports);

}  // namespace qz::tools::scenario
