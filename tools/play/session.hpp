// A walk-through being played: makes its steps and keeps the transcript.
#pragma once

#include <functional>
#include <iosfwd>
#include <string>

#include "toolkit/test_driver.hpp"
#include "tools/play/play.hpp"
#include "tools/play/stage.hpp"
#include "tools/play/transcript.hpp"

namespace tools::play {

class Session {
 public:
  /// All outlive the session.
  Session(toolkit::TestDriver& driver, Stage& stage, std::ostream& out, const Style& style);

  /// Loads the script at an absolute path and runs its list under `startKey`.
  void start(const std::string& script, const std::string& startKey);

  /// Makes the step, or says in the transcript why a user could not make it.
  void perform(const Step& step);

  /// Says how the walk-through ended or what it waits for, and what it leaves its host.
  void conclude();

  const StepPicture& picture() const { return transcript_.latest(); }
  /// Whether a step could not be made, or a list raised.
  bool failed() const { return failed_; }

 private:
  void press(long tag);
  void advance(double seconds);
  void run(const std::string& heading, const std::function<void()>& action);
  void refuse(const std::string& heading, const std::string& reason);
  StepPicture look() { return takePicture(driver_, stage_.engine(), stage_.title()); }
  std::string recordedStates();

  toolkit::TestDriver& driver_;
  Stage& stage_;
  Transcript transcript_;
  bool failed_ = false;
};

}  // namespace tools::play
