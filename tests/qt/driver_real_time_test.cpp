// SPDX-License-Identifier: MIT
// The driver with a person to watch: time passes as on a clock.

#include <gtest/gtest.h>

#include <QGuiApplication>
#include <chrono>
#include <stdexcept>

#include "drivers/qt/qt_driver.hpp"

namespace qz {

namespace {

using namespace toolkit;

/// Returns how many seconds `action` takes.
template <class Action>
double secondsOf(Action action) {
  const auto began = std::chrono::steady_clock::now();
  action();
  return std::chrono::duration<double>(std::chrono::steady_clock::now() - began).count();
}

struct DriverRealTime : testing::Test {
  drivers::QtDriver driver;
  DriverRealTime() { driver.useRealTime(); }
};

TEST_F(DriverRealTime, TakesAsLongAsItSaysAndFiresTimersMeanwhile) {
  int firings = 0;
  driver.toolkit().runLoop().schedule(0.1, true, [&](const Ref<Timer>&) { ++firings; });
  EXPECT_GE(secondsOf([&] { driver.advance(0.15); }), 0.15);
  EXPECT_EQ(firings, 1);
  EXPECT_GE(secondsOf([&] { driver.advance(0.05); }), 0.05);
  EXPECT_EQ(firings, 2) << "the clock stood elsewhere than at 0.15 seconds";
}

TEST_F(DriverRealTime, EndsEarlyWhenATimerRaises) {
  driver.toolkit().runLoop().schedule(
      0.02, false, [](const Ref<Timer>&) { throw std::runtime_error("broken"); });
  const double seconds = secondsOf([&] { EXPECT_THROW(driver.advance(60), std::runtime_error); });
  EXPECT_LT(seconds, 30);
}

TEST_F(DriverRealTime, NobodySeesAPlatformWithoutAScreen) {
  EXPECT_EQ(driver.hasPerson(), QGuiApplication::platformName() != "offscreen");
}

}  // namespace

}  // namespace qz
