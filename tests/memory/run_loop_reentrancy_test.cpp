// SPDX-License-Identifier: MIT
// How a timer's action may affect the run loop that calls it, and how long the action lives.

#include <gtest/gtest.h>

#include <memory>
#include <stdexcept>
#include <string>
#include <vector>

#include "toolkit/memory/run_loop.hpp"

namespace qz::toolkit::memory {
namespace {

class RunLoopReentrancy : public testing::Test {
 protected:
  Ref<Timer> note(const std::string& name, double interval, bool repeats = false) {
    return loop.schedule(interval, repeats, [this, name](const Ref<Timer>&) { fired += name; });
  }

  std::string fired;
  MemoryRunLoop loop;
};

TEST_F(RunLoopReentrancy, AnActionInvalidatesItsOwnTimer) {
  const Ref<Timer> timer = loop.schedule(1, true, [this](const Ref<Timer>& own) {
    fired += "r";
    own->invalidate();
    EXPECT_FALSE(own->isValid());
  });
  loop.advance(5);
  EXPECT_EQ(fired, "r");
  EXPECT_FALSE(timer->isValid());
}

TEST_F(RunLoopReentrancy, AnActionInvalidatesAnotherTimerThatIsDueAtOnce) {
  Ref<Timer> victim;
  loop.schedule(1, false, [&](const Ref<Timer>&) { victim->invalidate(); });
  victim = note("v", 1);
  note("a", 1);
  loop.advance(1);
  EXPECT_EQ(fired, "a");
}

TEST_F(RunLoopReentrancy, TheOthersFireInsideAFiringThatLetsTimePass) {
  std::vector<double> times;
  const Ref<Timer> outer = loop.schedule(1, true, [&](const Ref<Timer>&) {
    fired += "(";
    loop.advance(2.25);
    times.push_back(loop.now());
    fired += ")";
  });
  note("a", 2, true);
  note("b", 3);
  loop.advance(1);
  EXPECT_EQ(fired, "(ab)");  // its own firings at 2 and 3 are skipped
  EXPECT_EQ(times, std::vector{3.25});
  EXPECT_EQ(loop.now(), 3.25);
  EXPECT_EQ(outer->timeLeft(), 0.75);  // it still fires at whole seconds
}

TEST_F(RunLoopReentrancy, TimeDoesNotGoBackAfterAFiringThatLetTimePass) {
  std::vector<double> times;
  loop.schedule(1, false, [&](const Ref<Timer>&) { loop.advance(10); });
  loop.schedule(2, true, [&](const Ref<Timer>&) { times.push_back(loop.now()); });
  loop.advance(4);
  EXPECT_EQ(times, (std::vector<double>{2, 4, 6, 8, 10}));
  EXPECT_EQ(loop.now(), 11);
}

TEST_F(RunLoopReentrancy, ATimerWhoseFiringTookTooLongFiresLate) {
  std::vector<double> times;
  const Ref<Timer> slow = loop.schedule(1, true, [&](const Ref<Timer>&) {
    times.push_back(loop.now());
    if (times.size() == 1) loop.advance(3);
  });
  loop.advance(5);
  EXPECT_EQ(times, (std::vector<double>{1, 5}));  // 2 and 3 are skipped, and 4 has just passed
  EXPECT_EQ(slow->timeLeft(), 1);
}

TEST_F(RunLoopReentrancy, AnInnerFiringInvalidatesTheOuterTimer) {
  const Ref<Timer> outer =
      loop.schedule(1, true, [&](const Ref<Timer>&) { fired += "o", loop.advance(1); });
  loop.schedule(1.5, false, [&](const Ref<Timer>&) { outer->invalidate(); });
  loop.advance(10);
  EXPECT_EQ(fired, "o");
  EXPECT_FALSE(outer->isValid());
}

TEST_F(RunLoopReentrancy, AnActionThatThrowsLeavesTheRunLoopInOrder) {
  const Ref<Timer> once =
      loop.schedule(1, false, [](const Ref<Timer>&) { throw std::runtime_error("once"); });
  const Ref<Timer> again =
      loop.schedule(2, true, [](const Ref<Timer>&) { throw std::runtime_error("again"); });
  note("a", 2);
  EXPECT_THROW(loop.advance(5), std::runtime_error);
  EXPECT_FALSE(once->isValid());
  EXPECT_EQ(loop.now(), 1);
  EXPECT_THROW(loop.advance(1), std::runtime_error);
  EXPECT_TRUE(again->isValid());
  EXPECT_EQ(again->timeLeft(), 2);
  loop.advance(0);
  EXPECT_EQ(fired, "a");
}

// --- how long an action lives ---

TEST_F(RunLoopReentrancy, AnInvalidTimerReleasesItsAction) {
  const auto held = std::make_shared<int>();
  const Ref<Timer> timer = loop.schedule(1, true, [held](const Ref<Timer>&) {});
  EXPECT_EQ(held.use_count(), 2);
  timer->invalidate();
  EXPECT_EQ(held.use_count(), 1);
}

TEST_F(RunLoopReentrancy, AOneShotTimerReleasesItsActionAfterItsFiring) {
  const auto held = std::make_shared<int>();
  const Ref<Timer> timer =
      loop.schedule(1, false, [held](const Ref<Timer>&) { EXPECT_EQ(held.use_count(), 2); });
  loop.advance(1);
  EXPECT_EQ(held.use_count(), 1);
  EXPECT_FALSE(timer->isValid());
}

TEST_F(RunLoopReentrancy, AnActionLivesUntilItsCallReturns) {
  auto held = std::make_shared<int>(7);
  const std::weak_ptr<int> watched = held;
  loop.schedule(1, true, [held = std::move(held), this](const Ref<Timer>& own) {
    own->invalidate();
    loop.advance(1);
    fired += std::to_string(*held);
  });
  loop.advance(1);
  EXPECT_EQ(fired, "7");
  EXPECT_TRUE(watched.expired());
}

/// Holds a timer, invalidates it on destruction, as an engine does, and may schedule another.
struct Holder {
  ~Holder() {
    timer->invalidate();
    if (loop) loop->schedule(1, false, [](const Ref<Timer>&) {});
  }
  Ref<Timer> timer;
  MemoryRunLoop* loop = nullptr;
};

TEST_F(RunLoopReentrancy, WhatAnActionHoldsMayInvalidateTheTimerAtItsEnd) {
  const auto held = [this] {
    auto holder = std::make_shared<Holder>();
    holder->timer = loop.schedule(1, true, [holder](const Ref<Timer>&) {});
    return std::weak_ptr<Holder>(holder);
  };
  const auto invalidated = held();
  invalidated.lock()->timer->invalidate();
  EXPECT_TRUE(invalidated.expired());

  const auto ended = held();
  loop.schedule(0.5, false, [&](const Ref<Timer>&) { ended.lock()->timer->invalidate(); });
  loop.advance(1);
  EXPECT_TRUE(ended.expired());
}

TEST_F(RunLoopReentrancy, TheEndOfTheRunLoopReleasesAllTimers) {
  auto own = std::make_unique<MemoryRunLoop>();
  const auto holder = std::make_shared<Holder>();
  std::weak_ptr<Holder> watched;
  {
    const auto second = std::make_shared<Holder>();
    second->loop = own.get();
    second->timer = own->schedule(2, true, [second](const Ref<Timer>&) {});
    watched = second;
  }
  holder->timer = own->schedule(1, false, [holder](const Ref<Timer>&) {});
  own.reset();
  EXPECT_TRUE(watched.expired());
  EXPECT_EQ(holder.use_count(), 1);
  EXPECT_FALSE(holder->timer->isValid());
  holder->timer->invalidate();
  EXPECT_EQ(holder->timer->timeLeft(), 0);
}

}  // namespace
}  // namespace qz::toolkit::memory
