// SPDX-License-Identifier: MIT
// Patterns for log lines.
#pragma once

#include <string_view>

namespace qz::tools::scenario {

/// Whether `text` matches `pattern`: `*` matches any run of characters, also an empty one, `\*` a
/// star, everything else itself.
bool matchesPattern(std::string_view pattern, std::string_view text);

}  // namespace qz::tools::scenario
