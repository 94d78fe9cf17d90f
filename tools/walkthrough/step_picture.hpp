// SPDX-License-Identifier: MIT
// What a walk-through shows at one moment: its window, the controls in it, and what the engine has
// pending. A picture is a copy; nothing that happens later changes it.
#pragma once

#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "qz/drivers/driver.hpp"
#include "qz/engine.hpp"

namespace qz::tools::walkthrough {

/// Tells one object from another, even when the objects are gone and their addresses are used
/// again.
class Identity {
 public:
  Identity() = default;
  template <class T>
  Identity(const std::shared_ptr<T>& object)
      : object_(object) {}  // NOLINT(google-explicit-constructor)

  friend bool operator==(const Identity& a, const Identity& b) {
    return !a.object_.owner_before(b.object_) && !b.object_.owner_before(a.object_);
  }

 private:
  std::weak_ptr<const void> object_;
};

struct ControlPicture {
  Identity identity;  ///< of the control, even after its tag has changed
  drivers::ViewPicture view;
  bool flashing = false;  ///< every tick of the flasher toggles its highlight
  bool hasList = false;   ///< the script has a list under its tag
  bool shadowed = false;  ///< a control behind it has the same tag, and is found instead

  friend bool operator==(const ControlPicture&, const ControlPicture&) = default;
};

struct TimerPicture {
  Identity identity;
  std::string key;      ///< of the list that it runs
  double timeLeft = 0;  ///< seconds

  friend bool operator==(const TimerPicture&, const TimerPicture&) = default;
};

struct StepPicture {
  std::string title;  ///< of the window, as its host gave it; may be empty
  std::optional<drivers::WindowPicture> window;  ///< absent: there is no walk-through window
  std::vector<ControlPicture> controls;          ///< directly in the window, back to front
  std::vector<TimerPicture> timers;              ///< pending, in the order of their firing
  std::optional<std::string> lastList;           ///< key of the list that was started last
  bool flashingAllowed = false;
  bool ended = false;  ///< the walk-through is over

  friend bool operator==(const StepPicture&, const StepPicture&) = default;
};

/// Returns a hash of what the picture shows. Equal pictures have equal hashes.
std::size_t hashOf(const StepPicture& picture);

/// Takes a picture of the walk-through that `engine` runs on the driver's toolkit. The caller gives
/// the window's title, because the toolkit's windows have none.
StepPicture takePicture(drivers::Driver& driver, const QZ_Plist_State_Parser& engine,
                        std::string title);

}  // namespace qz::tools::walkthrough
