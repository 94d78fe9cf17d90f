// SPDX-License-Identifier: MIT
// Whether the texts of a source have room in their controls.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "tools/steps/source.hpp"

namespace qz::tools::steps {

/// Shows every step and says of each text that its control has no room for: where it is, in which
/// step and control, and how much is missing. Absent if no toolkit of this build measures texts.
std::optional<std::vector<std::string>> textsWithoutRoom(const Source& source);

}  // namespace qz::tools::steps
