// SPDX-License-Identifier: MIT
// What a user can press in a picture of a walk-through, and where the walk-through stands.
#pragma once

#include <optional>
#include <string>

#include "tools/play/step_picture.hpp"

namespace tools::play {

/// The control that scripts and presses mean by `tag`: the back-most one. Null when there is none.
const ControlPicture* controlWithTag(const StepPicture& picture, toolkit::Tag tag);

/// A tag with the title of its button, where it is one: "3 (Next)".
std::string pressWords(const StepPicture& picture, toolkit::Tag tag);

/// Why a user cannot press the tag; nothing when they can.
std::optional<std::string> whyNotPress(const StepPicture& picture, toolkit::Tag tag);

/// Why the walk-through stands still: nothing that a user can do, and no timer, runs a list.
/// Nothing when there is a way on, or the walk-through has ended.
std::optional<std::string> whyNoWayOn(const StepPicture& picture);

/// Whether the walk-through ended, or what it waits for. A sentence.
std::string standing(const StepPicture& picture);

}  // namespace tools::play
