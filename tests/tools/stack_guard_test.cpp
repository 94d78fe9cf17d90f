// SPDX-License-Identifier: MIT
// The stack guard: lists that run each other endlessly close the program with one line.
#include "tools/support/stack_guard.hpp"

#include <gtest/gtest.h>

#include <csignal>
#include <sstream>
#include <string>

#include "play_files.hpp"
#include "qz/toolkit/memory/memory_toolkit.hpp"
#include "tools/play/play.hpp"
#include "tools/support/input_file.hpp"

namespace qz::tools {
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

TEST_F(StackGuard, LeavesAloneAScriptWhoseEndlessListsDoNotRun) {
  installStackGuard();
  EXPECT_EQ(playFrom("3"), ExitStatus::fine);
}

// The thread sanitizer takes minutes for a stack that is exhausted.
#if defined(__linux__) && !defined(__SANITIZE_THREAD__)
TEST_F(StackGuard, EndsTheProgramWithTheListsThatRunEachOther) {
  const auto endless = [] {
    installStackGuard();
    playFrom("1");
  };
  EXPECT_EXIT(endless(), testing::ExitedWithCode(stackExhausted),
              "^qz-walkthrough: script.plist: the stack is exhausted: lists run each other "
              "endlessly \\(1 -> 2 -> 1\\)\n$");
}

// A lock of the engine may be held for ever when the stack ends; then an alarm ends the wait.
TEST_F(StackGuard, EndsTheProgramEvenIfTheEngineDoesNotAnswer) {
  const auto waiting = [] {
    installStackGuard();
    toolkit::memory::MemoryToolkit toolkit;
    const auto engine = QZ_Plist_State_Parser::init(toolkit);
    guardScript(*engine, "script.plist", InputFile("script.plist", "a script").dictionary());
    std::raise(SIGALRM);
  };
  EXPECT_EXIT(waiting(), testing::ExitedWithCode(stackExhausted),
              "^qz-walkthrough: script.plist: the stack is exhausted: lists run each other");
}

TEST_F(StackGuard, LeavesOtherBadAccessesToTheSystem) {
  const auto broken = [] {
    installStackGuard();
    std::raise(SIGSEGV);
    std::raise(SIGSEGV);
  };
  EXPECT_EXIT(broken(), testing::KilledBySignal(SIGSEGV), "^$");
}
#endif

}  // namespace
}  // namespace qz::tools
