// SPDX-License-Identifier: MIT
// Says how far a walk-through has come. The library qz::progress has one that explores the script.
#pragma once

#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "qz/api.hpp"
#include "qz/toolkit/tag.hpp"

namespace qz {

/// What the further course of a walk-through can depend on in one control.
struct ControlOutline {
  enum class Kind : std::uint8_t { button, textField, imageView, other };

  Kind kind = Kind::other;
  toolkit::Tag tag = 0;
  bool isHidden = false;
  bool isEnabled = true;
};

/// The controls of a walk-through window from back to front, and the keys of its pending timers.
struct WindowOutline {
  std::vector<ControlOutline> controls;
  std::vector<std::string> timers = {};
};

/// Accompanies one walk-through at a time.
class QZ_API ProgressMeter {
 public:
  virtual ~ProgressMeter() = default;

  /// A walk-through begins with the list under the smallest tag. `script` is the property list, and
  /// `window` the walk-through window before any list has run. The meter may call `changed`, on any
  /// thread, when `share` has become known; never after `end`.
  virtual void begin(std::string script, WindowOutline window, std::function<void()> changed) = 0;
  /// Returns the share of the shortest way to the end that is done, from 0 to 1, while the window
  /// is so between two presses; absent if it is not known.
  virtual std::optional<double> share(const WindowOutline& window) const = 0;
  /// The walk-through is over, or is not to be measured any more.
  virtual void end() = 0;
};

}  // namespace qz
