// SPDX-License-Identifier: MIT
// Reading a file as a whole.
#pragma once

#include <optional>
#include <string>

namespace tools {

/// The contents of a file, or of a pipe up to its end. Absent when it cannot be opened, or not be
/// read to its end; `errno` then says why.
std::optional<std::string> wholeFile(const std::string& path);

}  // namespace tools
