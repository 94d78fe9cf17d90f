// SPDX-License-Identifier: MIT
// Timers on Qt's event loop.

#include "toolkit/qt/run_loop.hpp"

#include <gtest/gtest.h>

#include <QEventLoop>
#include <QTest>
#include <limits>
#include <string>
#include <vector>

#include "qz/toolkit/qt/log.hpp"

namespace qz {

namespace {

using toolkit::Ref;
using toolkit::Timer;
using toolkit::qt::Calls;
using toolkit::qt::QtRunLoop;

struct RunLoop : testing::Test {
  toolkit::qt::QtLog log;
  Calls calls{log};
  toolkit::qt::SteadyClock clock;
  QtRunLoop loop{clock, calls};
  std::string fired;

  toolkit::TimerAction note(char name) {
    return [this, name](const Ref<Timer>&) { fired += name; };
  }
};

TEST_F(RunLoop, FiresInTheOrderOfTimesAndThenOfScheduling) {
  loop.schedule(0.03, false, note('c'));
  loop.schedule(0.01, false, note('a'));
  loop.schedule(0.02, false, note('b'));
  loop.schedule(0.03, false, note('d'));
  EXPECT_TRUE(QTest::qWaitFor([&] { return fired.size() == 4; }));
  EXPECT_EQ(fired, "abcd");
}

TEST_F(RunLoop, RepeatsUntilItIsInvalidatedInAFiring) {
  loop.schedule(0.01, true, [this](const Ref<Timer>& timer) {
    fired += 'x';
    if (fired.size() == 3) timer->invalidate();
  });
  EXPECT_TRUE(QTest::qWaitFor([&] { return fired.size() == 3; }));
  loop.schedule(0.05, false, note('.'));
  EXPECT_TRUE(QTest::qWaitFor([&] { return fired.ends_with('.'); }));
  EXPECT_EQ(fired, "xxx.");
}

// Intervals that Qt's own timers do not allow, or would treat as zero.
TEST_F(RunLoop, TakesIntervalsOfAnyLength) {
  for (const double interval :
       {2147483.648, 25.0 * 24 * 60 * 60, 1.8e19, std::numeric_limits<double>::infinity()}) {
    const auto timer = loop.schedule(interval, false, note('!'));
    EXPECT_EQ(timer->interval(), interval);
    EXPECT_GE(timer->timeLeft(), interval / 2);
  }
  loop.schedule(0.05, false, note('.'));
  EXPECT_TRUE(QTest::qWaitFor([&] { return fired.ends_with('.'); }));
  EXPECT_EQ(fired, ".");
}

TEST_F(RunLoop, GoesOnWithinAnEventLoopThatAFiringRuns) {
  QEventLoop inner;
  loop.schedule(0.01, false, [&](const Ref<Timer>&) {
    fired += '(';
    inner.exec();
    fired += ')';
  });
  loop.schedule(0.02, false, note('a'));
  loop.schedule(0.03, false, [&](const Ref<Timer>&) { inner.quit(); });
  EXPECT_TRUE(QTest::qWaitFor([&] { return fired.ends_with(')'); }));
  EXPECT_EQ(fired, "(a)");
}

TEST_F(RunLoop, GoesOnAfterAnException) {
  int caught = 0;
  calls.setHandler([&](const std::exception_ptr&) { ++caught; });
  loop.schedule(0.01, false, [](const Ref<Timer>&) { throw 1; });
  loop.schedule(0.02, false, note('a'));
  EXPECT_TRUE(QTest::qWaitFor([&] { return fired == "a"; }));
  EXPECT_EQ(caught, 1);
}

}  // namespace

}  // namespace qz
