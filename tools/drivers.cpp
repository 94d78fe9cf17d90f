// SPDX-License-Identifier: MIT
// The toolkits that this build of the tool has.
#include "tools/drivers.hpp"

#include <algorithm>
#include <string>

#include "toolkit/memory/memory_driver.hpp"
#if QZ_QT
#include "toolkit/qt/make_driver.hpp"
#endif
#include "tools/failure.hpp"
#include "tools/suggestions.hpp"

namespace tools {
namespace {

struct NamedDriver {
  std::string_view name;
  std::unique_ptr<toolkit::TestDriver> (*make)();
};

constexpr NamedDriver drivers[] = {
    {"memory", toolkit::memory::makeMemoryDriver},
#if QZ_QT
    {"qt", toolkit::qt::makeQtDriver},
#endif
};

// Says how to get a toolkit that other builds have; empty for any other name.
std::string_view howToGet(std::string_view name) {
  if (name != "qt") return {};
  return "this build is without Qt; install Qt 6.4 Widgets or later (scripts/setup qt, on Debian), "
         "then configure and build anew";
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

std::unique_ptr<toolkit::TestDriver> makeDriver(std::string_view name) {
  for (const NamedDriver& driver : drivers) {
    if (driver.name == name) return driver.make();
  }
  return nullptr;
}

std::unique_ptr<toolkit::TestDriver> requireDriver(std::string_view name) {
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

}  // namespace tools
