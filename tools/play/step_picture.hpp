// SPDX-License-Identifier: MIT
// What a walk-through shows at one moment: its window, the controls in it, and what the engine has
// pending. A picture is a copy; nothing that happens later changes it.
#pragma once

#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "QZ_Plist_State_Parser.hpp"
#include "toolkit/test_driver.hpp"

namespace tools::play {

struct ControlPicture {
  /// Stands for the control itself, so that it is known again whatever its tag has become.
  std::weak_ptr<const void> identity;
  toolkit::ViewPicture view;
  bool flashing = false;  ///< its highlight is toggled by every tick of the flasher
  bool hasList = false;   ///< the script has a list under its tag
  bool shadowed = false;  ///< a control behind it has the same tag, and is found in its place
};

struct TimerPicture {
  std::weak_ptr<const void> identity;
  std::string key;      ///< of the list that it runs
  double timeLeft = 0;  ///< seconds
};

struct StepPicture {
  std::string title;                             ///< of the window, as its host says; may be empty
  std::optional<toolkit::WindowPicture> window;  ///< absent: there is no walk-through window
  std::vector<ControlPicture> controls;          ///< directly in the window, back to front
  std::vector<TimerPicture> timers;              ///< pending, in the order of their firing
  std::optional<std::string> lastList;           ///< key of the list that was started last
  bool flashingAllowed = false;
  bool ended = false;  ///< the walk-through is over
};

/// Looks at the walk-through that `engine` runs on the driver's toolkit. The title is the caller's
/// to know: the toolkit's windows have none.
StepPicture takePicture(toolkit::TestDriver& driver, const QZ_Plist_State_Parser& engine,
                        std::string title);

}  // namespace tools::play
