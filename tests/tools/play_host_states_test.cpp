// SPDX-License-Identifier: MIT
// The states of buttons in files that describe a host's window.
#include <gtest/gtest.h>

#include <string>

#include "play_files.hpp"
#include "tools/walkthrough/host_window.hpp"

namespace qz::tools::play {
namespace {

using toolkit::State;

TEST(PlayHostStates, AreReadOfEveryKindOfButton) {
  const struct {
    const char* kind;
    const char* field;
    State state;
  } cases[] = {
      {"NSButton", "", State::off},
      {"NSButton", "state = off;", State::off},
      {"NSButton", "state = on;", State::on},
      {"NSButton:toggle", "state = off;", State::off},
      {"NSButton:mixed", "state = off;", State::off},
      {"NSButton:mixed", "state = mixed;", State::mixed},
      {"NSPopUpButton", "state = on;", State::on},
  };
  for (const auto& test : cases) {
    const WorkingDirectory directory;
    directory.write("host.plist", std::string("({class = \"") + test.kind +
                                      "\"; frame = (0, 0, 1, 1); " + test.field + "})");
    const HostWindow host = parseHostWindow(InputFile("host.plist", "a host's window"));
    ASSERT_EQ(host.controls.size(), 1U);
    EXPECT_EQ(host.controls[0].state, test.state) << test.kind << " " << test.field;
  }
}

}  // namespace
}  // namespace qz::tools::play
