// SPDX-License-Identifier: MIT
#include "tools/exploration/workers.hpp"

#include <gtest/gtest.h>

#include <atomic>
#include <thread>
#include <vector>

namespace qz::tools::check {
namespace {

TEST(Workers, EachWorksOnceInARun) {
  Workers workers(3);
  std::vector<int> calls(workers.count());
  for (int run = 0; run < 100; ++run) {
    workers.run([&](std::size_t worker) { ++calls[worker]; }, [] {});
  }
  EXPECT_EQ(calls, (std::vector<int>{100, 100, 100}));
}

TEST(Workers, WorkWhileTheCallerWorks) {
  Workers workers(1);
  std::atomic<bool> hasBegun = false;
  bool wasSeen = false;
  workers.run([&](std::size_t) { hasBegun = true; },
              [&] {
                while (!hasBegun) std::this_thread::yield();
                wasSeen = true;
              });
  EXPECT_TRUE(wasSeen);
}

TEST(Workers, MayBeNone) {
  Workers workers(0);
  int calls = 0;
  workers.run([&](std::size_t) { calls += 100; }, [&] { ++calls; });
  EXPECT_EQ(calls, 1);
}

}  // namespace
}  // namespace qz::tools::check
