// SPDX-License-Identifier: MIT
// A scenario gives each name only once: to a control, a window or a kept value.
#include <gtest/gtest.h>

#include <string>

#include "scenario_support.hpp"

namespace qz::tools::scenario {
namespace {

TEST(ScenarioNames, AreTakenByWindowsControlsAndKeptValues) {
  const std::string start =
      "window panel\ncontrol next NSButton 1 in panel\nengine\nkeep tags "
      "engine.originalTagValues\n";
  const struct {
    const char* statement;
    const char* problem;
  } cases[] = {
      {"window panel", "5:8: \"panel\" is already a window, since line 1"},
      {"window next", "5:8: \"next\" is already a control, since line 2"},
      {"window tags", "5:8: \"tags\" is already a kept value, since line 4"},
      {"window other", ""},
  };
  for (const auto& test : cases) EXPECT_EQ(refusal(start + test.statement), test.problem);
}

}  // namespace
}  // namespace qz::tools::scenario
