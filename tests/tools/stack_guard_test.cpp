// SPDX-License-Identifier: MIT
// The stack guard: lists that run each other without end close the program with one line.
#include "tools/stack_guard.hpp"

#include <gtest/gtest.h>

#include <sstream>
#include <string>

#include "play_files.hpp"
#include "tools/play/play.hpp"

namespace tools {
namespace {

/// A script whose lists 1 and 2 run each other, and whose list 3 ends.
class StackGuard : public testing::Test {
 protected:
  StackGuard() {
    directory_.write("script.plist",
                     "{ 1 = ((PROCESS_COMMANDS_FOR_ID, 2)); 2 = ((PROCESS_COMMANDS_FOR_ID, 1));"
                     "  3 = (IDLE_LOOP); }");
  }

  static ExitStatus playFrom(const std::string& startKey) {
    play::PlayOptions options;
    options.script = "script.plist";
    options.startKey = startKey;
    options.steps = {play::Advance{1}};
    std::istringstream in;
    std::ostringstream out;
    return play::play(options, {in, out, out, false, {}});
  }

 private:
  play::WorkingDirectory directory_;
};

TEST_F(StackGuard, leavesAloneAScriptWhoseEndlessListsDoNotRun) {
  installStackGuard();
  EXPECT_EQ(playFrom("3"), ExitStatus::fine);
}

#if defined(__linux__)
TEST_F(StackGuard, endsTheProgramWithTheListsThatRunEachOther) {
  const auto endless = [] {
    installStackGuard();
    playFrom("1");
  };
  EXPECT_EXIT(endless(), testing::ExitedWithCode(stackExhausted),
              "^qz-walkthrough: script.plist: the stack is exhausted: lists run each other without "
              "end \\(1 -> 2 -> 1\\)\n$");
}
#endif

}  // namespace
}  // namespace tools
