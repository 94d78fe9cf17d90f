// SPDX-License-Identifier: MIT
// Patterns for log lines.
#pragma once

#include <string_view>

namespace tools::scenario {

/// Whether `text` is what `pattern` says: a `*` stands for any run of characters, also an empty
/// one, `\*` for a star itself, everything else for itself.
bool matchesPattern(std::string_view pattern, std::string_view text);

}  // namespace tools::scenario
