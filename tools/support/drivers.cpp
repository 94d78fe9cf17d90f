// SPDX-License-Identifier: MIT
// The table of the toolkits.
#include "tools/support/drivers.hpp"

#include <algorithm>
#include <string>

#include "tools/support/failure.hpp"
#include "tools/support/suggestions.hpp"
#include "tools/support/toolkit_rows.hpp"

namespace qz::tools {
namespace {

std::vector<ToolkitRow> rowsByPlace() {
  auto rows = toolkitRows();
  std::stable_sort(rows.begin(), rows.end(),
                   [](const ToolkitRow& a, const ToolkitRow& b) { return a.place < b.place; });
  return rows;
}

// The first toolkit of this build with or without a display, or null.
const ToolkitRow* firstThat(bool hasDisplay) {
  for (const ToolkitRow& row : toolkits()) {
    if (row.make && row.hasDisplay == hasDisplay) return &row;
  }
  return nullptr;
}

}  // namespace

std::span<const ToolkitRow> toolkits() {
  static const std::vector<ToolkitRow> rows = rowsByPlace();
  return rows;
}

std::vector<std::string_view> toolkitNames() {
  std::vector<std::string_view> names;
  for (const ToolkitRow& row : toolkits()) names.push_back(row.name);
  return names;
}

std::vector<std::string_view> driverNames() {
  std::vector<std::string_view> names;
  for (const ToolkitRow& row : toolkits()) {
    if (row.make) names.push_back(row.name);
  }
  return names;
}

std::string testToolkit() { return std::string(firstThat(false)->name); }

std::string playerToolkit() {
  const ToolkitRow* row = firstThat(true);
  return row ? std::string(row->name) : testToolkit();
}

std::string toolkitHelp() {
  std::string help;
  for (const ToolkitRow& row : toolkits()) {
    if (!row.make) continue;
    help += help.empty() ? "" : ", ";
    help += std::string(row.name) + " (" + std::string(row.description) + ")";
  }
  return help;
}

std::unique_ptr<drivers::Driver> makeDriver(std::string_view name) {
  for (const ToolkitRow& row : toolkits()) {
    if (row.name == name && row.make) return row.make();
  }
  return nullptr;
}

std::unique_ptr<drivers::Driver> requireDriver(std::string_view name) {
  if (auto driver = makeDriver(name)) return driver;
  for (const ToolkitRow& row : toolkits()) {
    if (row.name != name) continue;
    throw Failure(ExitStatus::badInput, "this build does not include the toolkit " +
                                            std::string(name) + ": " + std::string(row.howToGet));
  }
  const auto known = driverNames();
  throw Failure(ExitStatus::badInput,
                "unknown toolkit " + (name.empty() ? "\"\"" : std::string(name)) +
                    "; this build has " + enumerate({known.begin(), known.end()}) +
                    didYouMean(name, known));
}

}  // namespace qz::tools
