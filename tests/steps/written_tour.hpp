// SPDX-License-Identifier: MIT
// A walk-through in steps as its author writes it, before anything of it is worked out.
#pragma once

#include <cstddef>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <tuple>
#include <utility>
#include <vector>

#include "qz/drivers/view_kinds.hpp"
#include "qz/toolkit/toolkit.hpp"

namespace qz::meaning {

/// Before the name of a step that takes the place of the step at which the press is.
inline constexpr std::string_view instead = "instead of this: ";

using drivers::ViewKind;

/// A control of the host's window.
struct HostControl {
  std::string name{};  ///< empty: the source does not name it
  ViewKind kind = ViewKind::textField;
  toolkit::Tag tag = 0;
  std::string caption{};  ///< title, text or name of the image
  std::string toolTip{};
  bool isShown = true;
  bool isEnabled = true;
  toolkit::State state = toolkit::State::off;
};

/// A text, title or picture.
struct Content {
  std::string written{};
  bool isHtml = false;
};

/// What a part says of a control; absent: nothing. Names and texts may have parameters in braces.
struct Words {
  bool isEntry = false;  ///< the control's name is an entry of the part
  std::optional<Content> content{};
  std::optional<std::string> font{};
  std::optional<bool> isCentered{};
  std::optional<std::string> toolTip{};
  std::optional<std::string> color{};
  std::optional<bool> isRed{};
  std::optional<bool> isOn{};
  std::optional<bool> isShown{};
  std::optional<bool> isEnabled{};
  std::optional<bool> flashes{};
  std::optional<std::string> press{};  ///< a step, also after `instead`; or back, end or nothing

  /// Everything that can be said or not.
  auto options() {
    return std::tie(content, font, isCentered, toolTip, color, isRed, isOn, isShown, isEnabled,
                    flashes, press);
  }
};

struct Wait {
  int seconds = 0;
  std::string go{};
  bool givesUp = false;  ///< after other presses
};

using Arguments = std::map<std::string, std::string>;

struct Use {
  std::string fragment{};
  Arguments arguments{};
};

/// A step, a fragment, or what every step says.
struct Part {
  std::map<std::string, Words> controls{};
  std::optional<std::string> background{};
  std::optional<Wait> wait{};
  std::optional<bool> isPassedOver{};
  std::vector<Use> uses{};
  std::string like{};  ///< empty: like no other

  /// The same, except of controls.
  auto options() { return std::tie(background, wait, isPassedOver); }
};

struct Tour {
  std::vector<HostControl> controls{};  ///< back to front
  Part everyStep{};
  std::map<std::string, Part> fragments{};
  std::optional<std::size_t> backOver{};
  std::vector<std::pair<std::string, Part>> steps{};
};

}  // namespace qz::meaning
