// The toolkits that this build of the tool has.
#include "tools/drivers.hpp"

#include <string>

#include "toolkit/memory/memory_driver.hpp"
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
};

}  // namespace

std::vector<std::string_view> driverNames() {
  std::vector<std::string_view> names;
  for (const NamedDriver& driver : drivers) names.push_back(driver.name);
  return names;
}

std::unique_ptr<toolkit::TestDriver> makeDriver(std::string_view name) {
  for (const NamedDriver& driver : drivers) {
    if (driver.name == name) return driver.make();
  }
  return nullptr;
}

std::unique_ptr<toolkit::TestDriver> requireDriver(std::string_view name) {
  if (auto driver = makeDriver(name)) return driver;
  const auto known = driverNames();
  throw Failure(ExitStatus::badInput, "unknown toolkit " + std::string(name) + "; this build has " +
                                          enumerate({known.begin(), known.end()}) +
                                          didYouMean(name, known));
}

}  // namespace tools
