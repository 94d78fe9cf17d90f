// SPDX-License-Identifier: MIT
// Reads a whole file.
#pragma once

#include <optional>
#include <string>

namespace qz::tools {

/// Returns the contents of a file, or of a pipe up to its end. Absent if it cannot be opened or
/// read to its end; `errno` then says why.
std::optional<std::string> wholeFile(const std::string& path);

}  // namespace qz::tools
