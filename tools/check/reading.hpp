// SPDX-License-Identifier: MIT
// What is wrong with a script can be read off it: names, parameters and keys that the engine will
// not understand.
#pragma once

#include <vector>

#include "qz/toolkit/toolkit.hpp"
#include "tools/check/finding.hpp"
#include "tools/exploration/script.hpp"

namespace qz::tools::check {

/// Returns the findings in the order of the script. `toolkit` has the fonts, and the images of its
/// resource directory.
std::vector<Finding> readScript(const Script& script, toolkit::Toolkit& toolkit);

}  // namespace qz::tools::check
