// SPDX-License-Identifier: MIT
// Pictures of a walk-through in a directory: one PNG file a step, numbered in their order, and the
// transcript.
#pragma once

#include <fstream>
#include <string>
#include <string_view>

#include "qz/drivers/driver.hpp"
#include "tools/play/transcript.hpp"

namespace qz::tools::play {

using namespace walkthrough;

class Screenshots {
 public:
  /// Makes the directory if there is none, and deletes the pictures of an earlier walk-through.
  /// Throws a Failure if the driver's toolkit draws nothing, or the directory cannot be written.
  /// The driver must outlive it.
  Screenshots(drivers::Driver& driver, std::string directory);

  /// Also writes the transcript, plain, to `transcript.txt`. This must outlive the transcript.
  void keep(Transcript& transcript);

  /// Takes a picture of the window: "02-press-5.png" if `what` is "press-5" and there are two
  /// already. Does nothing if the window is not on the screen. Throws a Failure if the file cannot
  /// be written.
  void take(const toolkit::Ref<toolkit::Window>& window, std::string_view what);

 private:
  drivers::Driver& driver_;
  std::string directory_;
  std::ofstream text_;
  int taken_ = 0;
};

}  // namespace qz::tools::play
