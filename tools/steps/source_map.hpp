// SPDX-License-Identifier: MIT
// Where the lists and commands of a built script come from, for other programs.
#pragma once

#include <string>

#include "tools/steps/script_file.hpp"

namespace qz::tools::steps {

/// Returns a JSON object: the source, the name of the control for each tag, and for each list its
/// place, the step to which it leads, and the place of each command. A place in an included file
/// names that. `script` must be built of a
/// source. docs/qz-walkthrough.md describes the object.
std::string sourceMap(const ScriptFile& script);

}  // namespace qz::tools::steps
