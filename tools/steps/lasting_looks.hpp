// SPDX-License-Identifier: MIT
// What no command takes away again: the red of a button, the picture of an image view, and the
// background.
#pragma once

#include "tools/steps/scenes.hpp"

namespace qz::tools::steps {

/// Adds a mistake for every step at which a user would see something that only steps before it say.
void judgeLastingLooks(const Tour& tour, const Scenes& scenes, Mistakes& mistakes);

}  // namespace qz::tools::steps
