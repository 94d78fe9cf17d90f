// SPDX-License-Identifier: MIT
// Scenarios in which something other than a toolkit's exception is thrown.
#include <gtest/gtest.h>

#include <memory>
#include <stdexcept>

#include "qz/toolkit/run_loop.hpp"
#include "scenario_support.hpp"

namespace qz::tools::scenario {
namespace {

/// Returns a runner on memory toolkits on which a timer throws after a second.
Runner runnerWhoseTimerThrows() {
  Runner runner = quietRunner();
  runner.makeDriver = [] {
    auto driver = makeDriver("memory");
    driver->toolkit().runLoop().schedule(
        1, false, [](const auto&) { throw std::runtime_error("the disk is full"); });
    return driver;
  };
  return runner;
}

TEST(ScenarioForeignExceptions, FailTheStatementEvenIfItMayRaise) {
  const auto report = runAll("advance 0.5\nadvance 1", runnerWhoseTimerThrows()).at(0);
  EXPECT_EQ(report.verdict, Verdict::failed);
  EXPECT_EQ(report.failedLine, 2);
  EXPECT_EQ(report.problem, "expected no exception, got the disk is full");
}

}  // namespace
}  // namespace qz::tools::scenario
