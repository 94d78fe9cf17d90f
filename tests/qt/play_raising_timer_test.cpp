// SPDX-License-Identifier: MIT
// A person plays a script in which the list of a timer raises.

#include <gtest/gtest.h>

#include <QApplication>
#include <QTimer>
#include <QWidget>
#include <sstream>
#include <string>
#include <vector>

#include "drivers/qt/qt_driver.hpp"
#include "tests/tools/play_files.hpp"
#include "tools/play/session.hpp"
#include "tools/support/input_file.hpp"

namespace qz::tools::play {
namespace {

TEST(PlayRaisingTimer, IsAStepOfItsOwnAndThePersonGoesOn) {
  const WorkingDirectory directory;
  directory.write("script.plist", "{ 1 = ((SET_TIMER_FOR_ID, 1, 5)); 5 = text; }");
  PlayOptions options;
  options.script = directory.path() + "/script.plist";
  drivers::QtDriver driver;
  Stage stage(driver, planStage(options.stage, InputFile(options.script, "a script").dictionary(),
                                options.script));
  std::ostringstream out;
  Transcript transcript(out, {});
  Session session(driver, stage, transcript);
  session.start(options.script, "1");

  QTimer person;  // closes the window once the transcript tells of the exception
  person.callOnTimeout([&] {
    if (!session.problems().empty()) QApplication::closeAllWindows();
  });
  person.start(20);
  session.handOver();

  const std::string raised =
      "NSInvalidArgumentException: -[NSString count]: unrecognized selector sent to instance";
  EXPECT_EQ(session.problems(), std::vector<std::string>{"a timer fires: raised " + raised});
  EXPECT_NE(out.str().find("── 2. a timer fires "), std::string::npos) << out.str();
  EXPECT_NE(out.str().find("  Raised " + raised), std::string::npos) << out.str();
}

}  // namespace
}  // namespace qz::tools::play
