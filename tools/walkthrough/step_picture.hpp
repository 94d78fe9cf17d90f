// SPDX-License-Identifier: MIT
// What a walk-through shows at one moment: its window, the controls in it, and what the engine has
// pending. A picture is a copy; nothing that happens later changes it.
#pragma once

#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "drivers/driver.hpp"
#include "qz/engine.hpp"

namespace qz::tools::walkthrough {

struct ControlPicture {
  /// Identifies the control even after its tag has changed.
  std::weak_ptr<const void> identity;
  drivers::ViewPicture view;
  bool flashing = false;  ///< every tick of the flasher toggles its highlight
  bool hasList = false;   ///< the script has a list under its tag
  bool shadowed = false;  ///< a control behind it has the same tag, and is found instead
};

struct TimerPicture {
  std::weak_ptr<const void> identity;
  std::string key;      ///< of the list that it runs
  double timeLeft = 0;  ///< seconds
};

struct StepPicture {
  std::string title;  ///< of the window, as its host gave it; may be empty
  std::optional<drivers::WindowPicture> window;  ///< absent: there is no walk-through window
  std::vector<ControlPicture> controls;          ///< directly in the window, back to front
  std::vector<TimerPicture> timers;              ///< pending, in the order of their firing
  std::optional<std::string> lastList;           ///< key of the list that was started last
  bool flashingAllowed = false;
  bool ended = false;  ///< the walk-through is over
};

/// Takes a picture of the walk-through that `engine` runs on the driver's toolkit. The caller gives
/// the window's title, because the toolkit's windows have none.
StepPicture takePicture(drivers::Driver& driver, const QZ_Plist_State_Parser& engine,
                        std::string title);

}  // namespace qz::tools::walkthrough
