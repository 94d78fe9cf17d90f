// SPDX-License-Identifier: MIT
// Says how far a walk-through has come. The library qz::progress has one that explores the script.
#pragma once

#include <functional>
#include <optional>
#include <string>

#include "qz/api.hpp"
#include "qz/engine.hpp"

namespace qz {

/// Accompanies one walk-through at a time.
class QZ_API ProgressMeter {
 public:
  virtual ~ProgressMeter() = default;

  /// A walk-through begins with the list under the smallest tag. `script` is the property list, and
  /// `window` the walk-through window before any list has run. `changed` is to be called, on any
  /// thread, when `share` has become known; it must not be called after `end`.
  virtual void begin(std::string script, const toolkit::Ref<toolkit::Window>& window,
                     std::function<void()> changed) = 0;
  /// Returns the share of the shortest way to the end that is done, from 0 to 1; absent if it is
  /// not known. `engine` is that of the walk-through, between two presses.
  virtual std::optional<double> share(const QZ_Plist_State_Parser& engine) const = 0;
  /// The walk-through is over, or is not to be measured any more.
  virtual void end() = 0;
};

}  // namespace qz
