// SPDX-License-Identifier: MIT
// A picture of a walk-through as text for a terminal.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

#include "tools/play/picture_diff.hpp"
#include "tools/walkthrough/step_picture.hpp"

namespace qz::tools::play {

using namespace walkthrough;

struct Style {
  bool color = false;       ///< with the escape sequences of a colour terminal
  std::size_t width = 100;  ///< columns; rows and changes are wrapped to it
};

/// Returns the line that begins a step: "── 2. press 3 (Next) ──".
std::string renderHeading(int number, std::string_view what, const Style& style);

/// Shows the window, its controls in aligned columns, and what is pending. Marks the `changes`: "*"
/// before what changed, with the old and new values below; "+" before a new control, "-" before one
/// that is gone. Every line ends with a line end.
std::string renderPicture(const StepPicture& picture, const PictureChanges& changes,
                          const Style& style);

}  // namespace qz::tools::play
