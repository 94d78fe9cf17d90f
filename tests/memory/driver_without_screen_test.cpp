// SPDX-License-Identifier: MIT
// What a driver does that a toolkit without a screen has no use for.
#include <gtest/gtest.h>

#include <filesystem>

#include "drivers/memory/memory_driver.hpp"

namespace qz::toolkit::memory {
namespace {

TEST(DriverWithoutScreen, LetsTimePassAtOnceEvenInRealTime) {
  drivers::MemoryDriver driver;
  int firings = 0;
  driver.toolkit().runLoop().schedule(3600, true, [&](const Ref<Timer>&) { ++firings; });
  driver.useRealTime();
  driver.advance(7200);
  EXPECT_EQ(firings, 2);
}

TEST(DriverWithoutScreen, HasNoPersonToHandOverTo) {
  drivers::MemoryDriver driver;
  EXPECT_FALSE(driver.hasPerson());
  int calls = 0;
  driver.handOver([&](const Ref<View>&) { ++calls; }, [&] { return ++calls < 100; });
  EXPECT_EQ(calls, 0);
}

TEST(DriverWithoutScreen, SavesNoPictures) {
  drivers::MemoryDriver driver;
  const auto window = driver.makeWindow({0, 0, 10, 10});
  const auto path = std::filesystem::temp_directory_path() / "driver-without-screen.png";
  EXPECT_FALSE(driver.draws());
  EXPECT_FALSE(driver.savePicture(window, path.string()));
  EXPECT_FALSE(std::filesystem::exists(path));
}

}  // namespace
}  // namespace qz::toolkit::memory
