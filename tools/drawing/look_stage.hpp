// SPDX-License-Identifier: MIT
// A window that shows what an exploration has found, on any toolkit, without playing the way there.
#pragma once

#include <cstdint>
#include <string>

#include "qz/drivers/driver.hpp"
#include "tools/exploration/exploration.hpp"
#include "tools/walkthrough/stage.hpp"
#include "tools/walkthrough/step_picture.hpp"

namespace qz::tools::drawing {

/// Shows one place with one look. Each has a stage of its own, so that nothing is left of others.
class LookStage {
 public:
  /// Makes the window of the exploration's setting. The arguments must outlive the stage, and the
  /// driver's resource path must be that of the setting. Throws a Failure if an image of the host's
  /// window is unknown.
  LookStage(drivers::Driver& driver, const check::Exploration& exploration, std::uint32_t place,
            std::uint32_t look);

  /// Returns what the window shows, with the pending timers and the names of the script's source.
  /// The list that was started last is absent.
  walkthrough::StepPicture picture();
  toolkit::Ref<toolkit::Window> window() { return stage_.engine().tutorialWindow(); }

 private:
  void showControls(const check::Looks::Parts& parts);
  void showBackground(const check::Looks::Parts& parts);
  void showFlashing(const check::Looks::Parts& parts);

  drivers::Driver& driver_;
  const check::Exploration& exploration_;
  std::uint32_t place_;
  walkthrough::Stage stage_;
};

}  // namespace qz::tools::drawing
