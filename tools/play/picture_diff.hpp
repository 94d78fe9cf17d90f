// SPDX-License-Identifier: MIT
// What changed from one picture of a walk-through to the next.
#pragma once

#include <string>
#include <vector>

#include "tools/walkthrough/step_picture.hpp"

namespace qz::tools::play {

using namespace walkthrough;

/// One thing that changed, in words.
struct Change {
  std::string what;
  std::string before;
  std::string now;

  friend bool operator==(const Change&, const Change&) = default;
};

struct ControlChanges {
  bool isNew = false;  ///< the earlier picture does not have the control
  std::vector<Change> changes;
};

struct PictureChanges {
  std::vector<Change> window;
  std::vector<ControlChanges>
      controls;                      ///< one for each control of the later picture, in its order
  std::vector<ControlPicture> gone;  ///< controls that only the earlier picture has
  std::vector<Change> engine;        ///< timers, flashing, the list that was started last

  /// True if nothing changed.
  bool none() const;
};

/// Returns what is different in `now`. A control counts as the same even if its tag has changed. A
/// timer counts as changed if it was armed, armed again or is gone, not because time has passed.
PictureChanges diffPictures(const StepPicture& before, const StepPicture& now);

}  // namespace qz::tools::play
