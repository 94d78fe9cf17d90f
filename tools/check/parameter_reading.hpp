// SPDX-License-Identifier: MIT
// Reads the parameters of one compound command.
#pragma once

#include <vector>

#include "qz/toolkit/toolkit.hpp"
#include "tools/check/finding.hpp"
#include "tools/exploration/script.hpp"

namespace qz::tools::check {

/// Returns what is wrong with the parameters. `element` must be a compound command that exists.
std::vector<Finding> readParameters(const Element& element, toolkit::Toolkit& toolkit);

}  // namespace qz::tools::check
