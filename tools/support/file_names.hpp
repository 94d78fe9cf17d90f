// SPDX-License-Identifier: MIT
// Names of files that the tool makes of other names.
#pragma once

#include <string>
#include <string_view>

namespace qz::tools {

/// Returns the name with only letters and digits of ASCII, and with hyphens instead of anything
/// else: every file system takes it.
inline std::string fileWord(std::string_view name) {
  std::string word;
  for (const char c : name) {
    const bool isPlain = (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9');
    if (isPlain || !word.ends_with('-')) word += isPlain ? c : '-';
  }
  return word;
}

}  // namespace qz::tools
