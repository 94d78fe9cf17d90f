// SPDX-License-Identifier: MIT
// What changed from one picture of a walk-through to the next.
#pragma once

#include <string>
#include <vector>

#include "tools/play/step_picture.hpp"

namespace tools::play {

/// One thing that is another now, in words.
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

  /// Whether nothing at all changed.
  bool none() const;
};

/// What is different in `now`. A control is the same as before whatever its tag has become; of a
/// timer only that it was armed, armed anew or is gone counts, not that its time runs.
PictureChanges diffPictures(const StepPicture& before, const StepPicture& now);

}  // namespace tools::play
