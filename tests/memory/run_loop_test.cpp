// SPDX-License-Identifier: MIT
// The run loop: when timers fire, in which order, and the clock's time during a firing.

#include "toolkit/memory/run_loop.hpp"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <string>
#include <vector>

#include "qz/toolkit/exception.hpp"

namespace qz::toolkit::memory {
namespace {

constexpr double infinity = std::numeric_limits<double>::infinity();
constexpr double notANumber = std::numeric_limits<double>::quiet_NaN();

class RunLoopTest : public testing::Test {
 protected:
  /// Schedules a timer that adds its name and the time to `fired`.
  Ref<Timer> note(const std::string& name, double interval, bool repeats = false) {
    return loop.schedule(interval, repeats, [this, name](const Ref<Timer>&) {
      fired.push_back({name, loop.now()});
    });
  }
  std::string names() const {
    std::string all;
    for (const Firing& firing : fired) all += firing.name;
    return all;
  }

  struct Firing {
    std::string name;
    double at;
  };
  std::vector<Firing> fired;
  MemoryRunLoop loop;
};

TEST_F(RunLoopTest, AOneShotTimerFiresOnceWhenItIsDue) {
  const Ref<Timer> timer = note("a", 2);
  loop.advance(1.5);
  EXPECT_EQ(names(), "");
  EXPECT_DOUBLE_EQ(timer->timeLeft(), 0.5);
  loop.advance(0.5);
  EXPECT_EQ(names(), "a");
  loop.advance(100);
  EXPECT_EQ(names(), "a");
  EXPECT_FALSE(timer->isValid());
  EXPECT_EQ(timer->timeLeft(), 0);
  EXPECT_EQ(timer->interval(), 2);
}

TEST_F(RunLoopTest, AOneShotTimerIsValidWhileItFires) {
  bool valid = false;
  const Ref<Timer> timer = loop.schedule(1, false, [&](const Ref<Timer>& firing) {
    valid = firing->isValid() && firing == timer;
    EXPECT_EQ(firing->timeLeft(), 0);
  });
  loop.advance(1);
  EXPECT_TRUE(valid);
  EXPECT_FALSE(timer->isValid());
}

TEST_F(RunLoopTest, TimersFireByTimeAndThenByScheduling) {
  note("c", 2);
  note("a", 1);
  note("d", 2);
  note("b", 1.5);
  note("A", 1);
  loop.advance(3);
  EXPECT_EQ(names(), "aAbcd");
}

TEST_F(RunLoopTest, ARepeatingTimerKeepsItsPlaceAmongEqualOnes) {
  note("r", 0.5, true);
  note("x", 1);
  loop.advance(1);
  EXPECT_EQ(names(), "rrx");
}

TEST_F(RunLoopTest, TheClockShowsTheTimeOfTheFiring) {
  note("a", 1.25);
  note("r", 0.5, true);
  loop.advance(1.5);
  const double expected[] = {0.5, 1, 1.25, 1.5};
  ASSERT_EQ(fired.size(), 4U);
  for (std::size_t i = 0; i < 4; ++i) EXPECT_EQ(fired[i].at, expected[i]) << i;
  loop.advance(0.25);
  EXPECT_EQ(loop.now(), 1.75);
}

TEST_F(RunLoopTest, ARepeatingTimerDoesNotDrift) {
  note("r", 0.1, true);
  loop.advance(10'000);
  ASSERT_EQ(fired.size(), 100'000U);
  EXPECT_EQ(fired.back().at, 10'000);
  for (std::size_t i = 0; i < fired.size(); ++i) {
    ASSERT_EQ(fired[i].at, static_cast<double>(i + 1) * 0.1);
  }
}

TEST_F(RunLoopTest, TimeThatPassesInStepsAddsUp) {
  note("a", 1);
  note("b", 2.1);
  for (int i = 0; i < 10; ++i) loop.advance(0.1);
  EXPECT_EQ(names(), "a");
  for (int i = 0; i < 11; ++i) loop.advance(0.1);
  EXPECT_EQ(names(), "ab");
}

TEST_F(RunLoopTest, AnIntervalBelowTheLeastCountsAsTheLeast) {
  for (const double interval : {0.0, -0.0, -5.0, 0.00001, notANumber, -infinity}) {
    MemoryRunLoop own;
    int firings = 0;
    own.schedule(interval, true, [&](const Ref<Timer>&) { ++firings; });
    own.advance(0.00005);
    EXPECT_EQ(firings, 0) << interval;
    own.advance(0.00995);
    EXPECT_EQ(firings, 100) << interval;
  }
}

TEST_F(RunLoopTest, AnIntervalCanBeOfAnyLength) {
  note("u", 18446744073709551615.0);
  note("m", std::numeric_limits<double>::max());
  note("i", infinity);
  note("I", infinity, true);
  loop.advance(1e19);
  EXPECT_EQ(names(), "");
  loop.advance(1e19);
  EXPECT_EQ(names(), "u");
  loop.advance(infinity);
  EXPECT_EQ(names(), "um");
  EXPECT_TRUE(std::isfinite(loop.now()));
}

TEST_F(RunLoopTest, TimeOnlyPassesForwards) {
  note("a", 1);
  for (const double seconds : {0.0, -1.0, -infinity, notANumber}) {
    loop.advance(seconds);
    EXPECT_EQ(loop.now(), 0) << seconds;
  }
  EXPECT_EQ(names(), "");
}

TEST_F(RunLoopTest, IntervalIsAsGiven) {
  for (const double interval : {0.0, -3.0, 0.5, 1e30}) {
    EXPECT_EQ(note("a", interval)->interval(), interval);
  }
}

TEST_F(RunLoopTest, ATimerWithoutAnActionIsRefused) {
  EXPECT_THROW(loop.schedule(1, false, nullptr), InvalidArgumentException);
  loop.advance(2);
}

TEST_F(RunLoopTest, AnInvalidTimerDoesNotFire) {
  const Ref<Timer> timer = note("a", 1);
  const Ref<Timer> repeating = note("r", 1, true);
  timer->invalidate();
  timer->invalidate();
  EXPECT_FALSE(timer->isValid());
  EXPECT_EQ(timer->timeLeft(), 0);
  loop.advance(1);
  repeating->invalidate();
  loop.advance(5);
  EXPECT_EQ(names(), "r");
}

TEST_F(RunLoopTest, ATimerScheduledInAFiringFiresInTheSameAdvanceWhenItIsDue) {
  loop.schedule(1, false, [&](const Ref<Timer>&) {
    note("a", 0);
    note("b", 0.5);
    note("c", 3);
  });
  loop.advance(2);
  EXPECT_EQ(names(), "ab");
  EXPECT_EQ(fired[1].at, 1.5);
}

}  // namespace
}  // namespace qz::toolkit::memory
