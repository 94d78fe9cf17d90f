// SPDX-License-Identifier: MIT
// Writes files so that there is always a whole one.
#pragma once

#include <string>
#include <string_view>

namespace tools {

/// Makes `contents` what the file at `path` holds. The file that is there stays as it is until the
/// new one is complete on the disk, and keeps its permissions; a symbolic link keeps leading to it.
/// What is no regular file, such as a pipe, is written to. A Failure when that cannot be done.
void replaceFile(const std::string& path, std::string_view contents);

}  // namespace tools
