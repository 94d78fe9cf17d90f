// SPDX-License-Identifier: MIT
// Plays a walk-through: makes its steps and describes them in the transcript, which may be one that
// writes nothing.
#pragma once

#include <functional>
#include <iosfwd>
#include <optional>
#include <string>
#include <vector>

#include "qz/drivers/driver.hpp"
#include "qz/toolkit/exception.hpp"
#include "tools/play/play.hpp"
#include "tools/play/screenshots.hpp"
#include "tools/play/transcript.hpp"
#include "tools/walkthrough/stage.hpp"

namespace qz::tools::play {

using namespace walkthrough;

class Session {
 public:
  /// The arguments must outlive the session. `screenshots` may be null; else it gets a picture
  /// after each step, and after each list that a timer runs within one.
  Session(drivers::Driver& driver, Stage& stage, Transcript& transcript,
          Screenshots* screenshots = nullptr);

  /// Loads the script at an absolute path and runs its list under `startKey`.
  void start(const std::string& script, const std::string& startKey);

  /// Makes the step, or says in the transcript why a user could not make it.
  void perform(const Step& step);

  /// Leaves the window to the person at the screen, until the walk-through ends or they close it.
  /// Each press and each list that a timer runs is a step.
  void handOver();

  /// Says how the walk-through ended or what it waits for, and which button states it recorded.
  void conclude();

  const StepPicture& picture() const { return transcript_.latest(); }
  /// Returns a line for each step that could not be made and each list that raised; after
  /// `conclude`, also one if the walk-through is stuck.
  const std::vector<std::string>& problems() const { return problems_; }

 private:
  void press(toolkit::Tag tag);
  void advance(double seconds);
  void pass(double seconds);
  void run(const std::string& heading, const std::string& name,
           const std::function<void()>& action);
  void begin(const std::string& heading, const std::string& name);
  void noteRaised(const toolkit::Exception& exception);
  void end();
  void takeScreenshot(const std::string& name);
  bool watch();
  void refuse(const std::string& heading, const std::string& reason);
  StepPicture look() { return takePicture(driver_, stage_.engine(), stage_.title()); }
  std::string recordedStates();

  drivers::Driver& driver_;
  Stage& stage_;
  Transcript& transcript_;
  Screenshots* screenshots_;
  struct Begun {
    std::string heading;
    std::string name;  // for its picture; empty if it needs none
  };
  std::optional<Begun> begun_;  // the step that is not over yet
  std::vector<std::string> problems_;
};

}  // namespace qz::tools::play
