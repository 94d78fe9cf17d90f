// SPDX-License-Identifier: MIT
#include "tools/output_format.hpp"

#include <algorithm>
#include <filesystem>

namespace qz::tools {

std::vector<toolkit::FormatRow> writableFormats() {
  std::vector<toolkit::FormatRow> rows;
  for (const toolkit::FormatRow& row : toolkit::formats()) {
    if (row.write) rows.push_back(row);
  }
  std::stable_partition(rows.begin(), rows.end(),
                        [](const toolkit::FormatRow& row) { return row.format == standardFormat; });
  return rows;
}

toolkit::Format formatBySuffix(const std::string& path) {
  const auto suffix = std::filesystem::path(path).extension();
  for (const toolkit::FormatRow& row : writableFormats()) {
    const auto& known = row.suffixes;
    if (std::find(known.begin(), known.end(), suffix) != known.end()) return row.format;
  }
  return standardFormat;
}

}  // namespace qz::tools
