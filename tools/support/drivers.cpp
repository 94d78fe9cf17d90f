// SPDX-License-Identifier: MIT
// The toolkits that this build of the tool has.
#include "tools/support/drivers.hpp"

#include <algorithm>
#include <string>

#include "drivers/memory/memory_driver.hpp"
#if QZ_QT
#include "drivers/qt/make_driver.hpp"
#endif
#include "tools/support/failure.hpp"
#include "tools/support/suggestions.hpp"

namespace qz::tools {
namespace {

struct NamedDriver {
  std::string_view name;
  std::unique_ptr<drivers::Driver> (*make)();
};

constexpr NamedDriver drivers[] = {
    {"memory", drivers::makeMemoryDriver},
#if QZ_QT
    {"qt", drivers::makeQtDriver},
#endif
};

// Says how to get a toolkit that other builds have; empty for any other name.
std::string_view howToGet(std::string_view name) {
  if (name != "qt") return {};
  return "this build is without Qt; install Qt 6.4 Widgets or later (scripts/setup qt, on Debian), "
         "then configure and build again";
}

}  // namespace

std::vector<std::string_view> driverNames() {
  std::vector<std::string_view> names;
  for (const NamedDriver& driver : drivers) names.push_back(driver.name);
  return names;
}

std::string playerToolkit() {
  const auto names = driverNames();
  return std::find(names.begin(), names.end(), "qt") != names.end() ? "qt" : "memory";
}

std::unique_ptr<drivers::Driver> makeDriver(std::string_view name) {
  for (const NamedDriver& driver : drivers) {
    if (driver.name == name) return driver.make();
  }
  return nullptr;
}

std::unique_ptr<drivers::Driver> requireDriver(std::string_view name) {
  if (auto driver = makeDriver(name)) return driver;
  if (const auto way = howToGet(name); !way.empty())
    throw Failure(ExitStatus::badInput,
                  "no toolkit " + std::string(name) + ": " + std::string(way));
  const auto known = driverNames();
  throw Failure(ExitStatus::badInput,
                "unknown toolkit " + (name.empty() ? "\"\"" : std::string(name)) +
                    "; this build has " + enumerate({known.begin(), known.end()}) +
                    didYouMean(name, known));
}

}  // namespace qz::tools
