// SPDX-License-Identifier: MIT
// What the tool's standard output is connected to.
#pragma once

namespace qz::tools {

/// Whether to write in colour: if standard output is a terminal, and `NO_COLOR` is unset or empty
/// in the environment.
bool outputShowsColor();

}  // namespace qz::tools
