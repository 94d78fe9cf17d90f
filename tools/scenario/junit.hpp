// SPDX-License-Identifier: MIT
// Reports in the XML that continuous-integration services read (JUnit's).
#pragma once

#include <string>
#include <vector>

#include "tools/scenario/runner.hpp"

namespace tools::scenario {

/// One test suite a file, in the order of the reports, with one test case a scenario. What XML
/// cannot hold shows as U+FFFD.
std::string junitReport(const std::vector<Report>& reports);

}  // namespace tools::scenario
