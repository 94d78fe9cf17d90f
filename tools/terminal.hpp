// SPDX-License-Identifier: MIT
// What the tool's standard output is connected to.
#pragma once

namespace tools {

/// Whether to write in colour: to a terminal whose user has nothing against it (`NO_COLOR` in the
/// environment, when it is not empty).
bool outputShowsColor();

}  // namespace tools
