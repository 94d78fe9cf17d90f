// SPDX-License-Identifier: MIT
#include "tools/support/whole_file.hpp"

#include <cerrno>
#include <fstream>

namespace qz::tools {

std::optional<std::string> wholeFile(const std::string& path) {
  errno = 0;
  std::ifstream file(path, std::ios::binary);
  if (!file.is_open()) return std::nullopt;
  // In blocks: inserting the stream's buffer into another stream would hide a read error.
  std::string contents;
  char block[1 << 16];
  while (file.read(block, sizeof block) || file.gcount() > 0) {
    contents.append(block, static_cast<std::size_t>(file.gcount()));
  }
  if (file.bad()) return std::nullopt;
  return contents;
}

}  // namespace qz::tools
