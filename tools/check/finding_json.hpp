// SPDX-License-Identifier: MIT
// Findings and paths as JSON.
#pragma once

#include <nlohmann/json.hpp>

#include "tools/check/report.hpp"

namespace qz::tools::check {

/// Returns an array of the moves, such as `{"press": 2}`.
nlohmann::ordered_json jsonOf(const Path& path);

/// Returns an object. `file` is the script.
nlohmann::ordered_json jsonOf(const Finding& finding, const InputFile& file);

}  // namespace qz::tools::check
