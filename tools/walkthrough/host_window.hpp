// SPDX-License-Identifier: MIT
// The host's window that a walk-through is played over, and the file that describes it: an array of
// controls. docs/host-windows.md has the format.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "qz/drivers/driver.hpp"
#include "qz/toolkit/geometry.hpp"
#include "tools/support/input_file.hpp"

namespace qz::tools::walkthrough {

struct HostControl {
  drivers::ViewKind kind = drivers::ViewKind::plain;
  toolkit::Tag tag = 0;
  toolkit::Rect frame;
  /// The title of a button, text of a field or name of an image; absent: the toolkit's default.
  std::optional<std::string> caption;
  bool hidden = false;
  bool enabled = true;
  toolkit::State state = toolkit::State::off;
  std::string toolTip;
};

struct HostWindow {
  std::string title;
  toolkit::Rect content{100, 100, 640, 480};  ///< on the screen
  std::vector<HostControl> controls;          ///< back to front
};

/// Returns the window that the file describes. Throws a Failure that names the wrong entry, counted
/// from 1.
HostWindow parseHostWindow(const InputFile& file);

/// Puts the window on the driver's screen. Throws a Failure, which names `file`, if one of its
/// images is unknown.
toolkit::Ref<toolkit::Window> makeHostWindow(drivers::Driver& driver, const HostWindow& host,
                                             std::string_view file);

}  // namespace qz::tools::walkthrough
