// The toolkits that this build of the tool has.
#include "tools/drivers.hpp"

#include "toolkit/memory/memory_driver.hpp"

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

}  // namespace tools
