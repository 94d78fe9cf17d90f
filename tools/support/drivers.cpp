// SPDX-License-Identifier: MIT
// The table of the toolkits.
#include "tools/support/drivers.hpp"

#include <string>

#include "drivers/memory/memory_driver.hpp"
#if QZ_QT
#include "drivers/qt/make_driver.hpp"
#endif
#include "tools/support/failure.hpp"
#include "tools/support/suggestions.hpp"

namespace qz::tools {
namespace {

using MakeDriver = std::unique_ptr<drivers::Driver> (*)();

#if QZ_QT
constexpr MakeDriver makeQt = drivers::makeQtDriver;
#else
constexpr MakeDriver makeQt = nullptr;
#endif

// The first is the one for tests and programs: every build has it.
constexpr ToolkitRow toolkitRows[] = {
    {.name = "memory",
     .description = "records everything, without a display",
     .howToGet = "",
     .hasDisplay = false,
     .make = drivers::makeMemoryDriver},
    {.name = "qt",
     .description = "windows of Qt 6 Widgets",
     .howToGet = "this build is without Qt; install Qt 6.4 Widgets or later (scripts/setup qt, on "
                 "Debian), then configure and build again",
     .hasDisplay = true,
     .make = makeQt},
    // Scenarios can name it; no build has it yet.
    {.name = "appkit",
     .description = "windows of AppKit",
     .howToGet = "",
     .hasDisplay = true,
     .make = nullptr},
};

}  // namespace

std::span<const ToolkitRow> toolkits() { return toolkitRows; }

std::vector<std::string_view> toolkitNames() {
  std::vector<std::string_view> names;
  for (const ToolkitRow& row : toolkitRows) names.push_back(row.name);
  return names;
}

std::vector<std::string_view> driverNames() {
  std::vector<std::string_view> names;
  for (const ToolkitRow& row : toolkitRows) {
    if (row.make) names.push_back(row.name);
  }
  return names;
}

std::string testToolkit() { return std::string(toolkitRows[0].name); }

std::string playerToolkit() {
  for (const ToolkitRow& row : toolkitRows) {
    if (row.make && row.hasDisplay) return std::string(row.name);
  }
  return testToolkit();
}

std::string toolkitHelp() {
  std::string help;
  for (const ToolkitRow& row : toolkitRows) {
    if (!row.make) continue;
    help += help.empty() ? "" : ", ";
    help += std::string(row.name) + " (" + std::string(row.description) + ")";
  }
  return help;
}

std::unique_ptr<drivers::Driver> makeDriver(std::string_view name) {
  for (const ToolkitRow& row : toolkitRows) {
    if (row.name == name && row.make) return row.make();
  }
  return nullptr;
}

std::unique_ptr<drivers::Driver> requireDriver(std::string_view name) {
  if (auto driver = makeDriver(name)) return driver;
  for (const ToolkitRow& row : toolkitRows) {
    if (row.name != name || row.howToGet.empty()) continue;
    throw Failure(ExitStatus::badInput,
                  "no toolkit " + std::string(name) + ": " + std::string(row.howToGet));
  }
  const auto known = driverNames();
  throw Failure(ExitStatus::badInput,
                "unknown toolkit " + (name.empty() ? "\"\"" : std::string(name)) +
                    "; this build has " + enumerate({known.begin(), known.end()}) +
                    didYouMean(name, known));
}

}  // namespace qz::tools
