// SPDX-License-Identifier: MIT
// Which control of one window is which of another.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

#include "tools/diff/both.hpp"
#include "tools/exploration/world.hpp"

namespace qz::tools::diff {

/// A control by its index in each of the two windows; absent where it does not exist.
using JointControl = Both<std::optional<std::size_t>>;

/// The controls of two windows. Each is there once.
class JointControls {
 public:
  /// Takes for the same: what has one name in both sources; else what has the same tag, and then
  /// what reads the same, before the start. A control of another kind is another control.
  JointControls(const check::Setting& before, const check::Setting& after);

  std::size_t count() const { return controls_.size(); }
  const JointControl& operator[](std::size_t joint) const { return controls_[joint]; }
  /// Returns the number of a control of one of the windows.
  std::size_t of(Side side, std::size_t control) const { return numbers_[side][control]; }

 private:
  std::vector<JointControl> controls_;
  Both<std::vector<std::size_t>> numbers_;
};

/// What is known of a control of one window.
struct ControlFacts {
  std::string name;  ///< in its source; empty: it has none
  toolkit::Tag tag = 0;
  drivers::ViewKind kind = drivers::ViewKind::plain;

  /// Returns such as "button 2", or the name.
  std::string words() const;
};

/// Returns what is known of a control before the start.
ControlFacts factsOf(const check::Setting& setting, std::size_t control);

}  // namespace qz::tools::diff
