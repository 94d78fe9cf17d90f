// SPDX-License-Identifier: MIT
// What a user can press in a picture of a walk-through, and how the walk-through can continue.
#pragma once

#include <optional>
#include <string>

#include "tools/walkthrough/possible_steps.hpp"
#include "tools/walkthrough/steps.hpp"

namespace qz::tools::play {

using namespace walkthrough;

/// Returns the tag of the control that is pressed; absent if no control has the name of the press.
std::optional<toolkit::Tag> tagOf(const StepPicture& picture, const Press& press);

/// Says that no control has the name, and what the controls are called.
std::string noSuchName(const StepPicture& picture, const std::string& name);

/// Returns the name of the control, or else the tag, with the first line of the title if its
/// control is a button: "3 (Next)".
std::string pressWords(const StepPicture& picture, toolkit::Tag tag);

/// Says why a user cannot press the control with this tag; absent if they can.
std::optional<std::string> whyNotPress(const StepPicture& picture, toolkit::Tag tag);

/// Says why the walk-through is stuck: nothing that a user can do, and no timer, runs a list.
/// Absent if it can continue or has ended.
std::optional<std::string> whyNoWayOn(const StepPicture& picture);

/// Says in one sentence that the walk-through ended or is stuck, or what it waits for.
std::string standing(const StepPicture& picture);

}  // namespace qz::tools::play
