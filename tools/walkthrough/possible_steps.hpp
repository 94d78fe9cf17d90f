// SPDX-License-Identifier: MIT
// What can happen next in a walk-through: what a user can press now, and what is pending.
#pragma once

#include <vector>

#include "tools/walkthrough/step_picture.hpp"

namespace qz::tools::walkthrough {

/// Returns the control that scripts and presses find by `tag`: the rearmost. Null if there is none.
const ControlPicture* controlWithTag(const StepPicture& picture, toolkit::Tag tag);

/// Whether a user can press the control: it is a button that is shown and enabled, and that its tag
/// finds.
bool canBePressed(const ControlPicture& control);

/// Whether a user can press anything: the walk-through is running in a window on the screen.
bool acceptsPresses(const StepPicture& picture);

/// Returns the tags of the buttons that a user can press now, back to front. A press of a button
/// without a list has effects too: it cancels the timers and records the button's state.
std::vector<toolkit::Tag> pressableTags(const StepPicture& picture);

/// Whether anything can run another list: a press, or a pending timer. False at the end, too.
bool canContinue(const StepPicture& picture);

}  // namespace qz::tools::walkthrough
