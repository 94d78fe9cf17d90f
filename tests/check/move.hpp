// SPDX-License-Identifier: MIT
// The moves of a user, and the starts of a host.
#pragma once

#include <cstddef>
#include <string>

#include "qz/toolkit/tag.hpp"

namespace qz::naive {

/// A start at a key (the smallest tag if it is empty), the press of a button, or a wait until the
/// first pending timer fires.
struct Move {
  enum class Kind { start, press, wait };

  Kind kind = Kind::start;
  std::string key{};      ///< of a start
  toolkit::Tag tag = 0;   ///< that the pressed button has
  std::size_t index = 0;  ///< of the pressed control among the window's controls, back to front
};

}  // namespace qz::naive
