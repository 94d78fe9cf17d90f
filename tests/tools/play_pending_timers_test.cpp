// SPDX-License-Identifier: MIT
// Pictures of walk-throughs list the pending timers by the time that is left.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "drivers/memory/memory_driver.hpp"
#include "play_files.hpp"
#include "tools/support/input_file.hpp"
#include "tools/walkthrough/stage.hpp"
#include "tools/walkthrough/step_picture.hpp"

namespace qz::tools::play {
namespace {

TEST(PlayPendingTimers, TheNextToFireComesFirst) {
  const WorkingDirectory directory;
  directory.write("script.plist",
                  "{ 1 = ((SET_TIMER_FOR_ID, 9, 2), (SET_TIMER_FOR_ID, 4, 3),"
                  "       (SET_TIMER_FOR_ID, 9, 4), (SET_TIMER_FOR_ID, 1, 5));"
                  "  2 = (); 3 = (); 4 = (); 5 = (); }");
  StageOptions options;
  drivers::MemoryDriver driver;
  Stage stage(driver, planStage(options, InputFile("script.plist", "a script").dictionary(),
                                "script.plist"));
  stage.load(directory.path() + "/script.plist", "1");

  std::vector<std::string> timers;
  for (const TimerPicture& timer : takePicture(driver, stage.engine(), "").timers) {
    timers.push_back(timer.key + " in " + std::to_string(static_cast<int>(timer.timeLeft)));
  }
  EXPECT_EQ(timers, (std::vector<std::string>{"5 in 1", "3 in 4", "2 in 9", "4 in 9"}));
}

}  // namespace
}  // namespace qz::tools::play
