// SPDX-License-Identifier: MIT
// Replaces files so that a complete one always exists.
#pragma once

#include <string>
#include <string_view>

namespace qz::tools {

/// Replaces the contents of the file at `path`. The old file stays in place until the new one is
/// complete on the disk. Permissions stay; a symbolic link still leads to the file. Anything but a
/// regular file, such as a pipe, is written to directly. Throws a Failure if the file cannot be
/// written.
void replaceFile(const std::string& path, std::string_view contents);

}  // namespace qz::tools
