// SPDX-License-Identifier: MIT
// Names for the controls of a window, such as a person gives them who writes a scenario.
#pragma once

#include <string>
#include <vector>

#include "tools/walkthrough/step_picture.hpp"

namespace qz::tools::cover {

/// Returns a text in small letters and digits of ASCII, with "-" in place of all else; at most
/// `length` bytes. Empty if nothing is left.
std::string slugOf(const std::string& text, std::size_t length);

/// Returns a name for each control of the picture: what the script's source calls it, else what a
/// user reads on the button, else its kind. A name that occurs again gets a number.
std::vector<std::string> controlNames(const walkthrough::StepPicture& picture);

}  // namespace qz::tools::cover
