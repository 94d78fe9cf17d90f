// SPDX-License-Identifier: MIT
// Many views, many timers: frequent operations are cheap, and nothing accumulates. The limits are
// processor times, about ten times those of unoptimised and instrumented builds.

#include <ctime>
#include <memory>
#include <vector>

#include "tests/memory/support.hpp"

namespace qz::toolkit::memory::test {
namespace {

/// Returns the processor time of `work`, in seconds.
template <class Work>
double secondsOf(const Work& work) {
  const std::clock_t start = std::clock();
  work();
  return static_cast<double>(std::clock() - start) / CLOCKS_PER_SEC;
}

using Scale = MemoryTest;

TEST_F(Scale, TenThousandSubviews) {
  const Ref<View> content = window->contentView();
  const double seconds = secondsOf([&] {
    for (Tag tag = 0; tag < 10'000; ++tag) makeIn(content, drivers::ViewKind::button, tag);
    Tag sum = 0;
    for (int scan = 0; scan < 100; ++scan) {
      for (const Ref<View>& view : content->subviews()) sum += view->tag();
    }
    EXPECT_EQ(sum, Tag{100} * 10'000 * 9'999 / 2);
    for (int click = 0; click < 1'000; ++click) driver.click(content->subviews()[9'999]);
    while (!content->subviews().empty()) driver.removeFromSuperview(content->subviews().back());
  });
  EXPECT_LT(seconds, 10);
}

TEST_F(Scale, AMillionFirings) {
  long firings = 0;
  const double seconds = secondsOf([&] {
    for (int i = 0; i < 10; ++i) {
      toolkit.runLoop().schedule(0.5, true, [&](const Ref<Timer>&) { ++firings; });
    }
    driver.advance(50'000);
  });
  EXPECT_EQ(firings, 1'000'000);
  EXPECT_LT(seconds, 20);
}

TEST_F(Scale, TimersThatWereInvalidatedDoNotPileUp) {
  const auto held = std::make_shared<int>();
  std::vector<std::weak_ptr<Timer>> timers;
  const double seconds = secondsOf([&] {
    for (int i = 0; i < 200'000; ++i) {
      const Ref<Timer> timer =
          toolkit.runLoop().schedule(1e9 + i, false, [held](const Ref<Timer>&) {});
      timer->invalidate();
      timers.push_back(timer.pointer());
    }
    driver.advance(1);
  });
  EXPECT_EQ(held.use_count(), 1);
  for (const auto& timer : timers) ASSERT_TRUE(timer.expired());
  EXPECT_LT(seconds, 10);
}

TEST_F(Scale, AHundredThousandPendingTimersFireInOrder) {
  double last = 0;
  int firings = 0;
  const double seconds = secondsOf([&] {
    for (int i = 0; i < 100'000; ++i) {
      toolkit.runLoop().schedule(1 + i * 7919 % 100'003, false, [&](const Ref<Timer>&) {
        EXPECT_GE(toolkit.parts().runLoop.now(), last);
        last = toolkit.parts().runLoop.now();
        ++firings;
      });
    }
    driver.advance(200'000);
  });
  EXPECT_EQ(firings, 100'000);
  EXPECT_LT(seconds, 10);
}

}  // namespace
}  // namespace qz::toolkit::memory::test
