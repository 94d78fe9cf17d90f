// SPDX-License-Identifier: MIT
// A family of scripts to check: the number of places doubles with each button.
#pragma once

#include <cstddef>

#include "qz/property_list/collections.hpp"
#include "tools/walkthrough/host_window.hpp"

namespace qz::bench {

/// What the start of these scripts runs.
inline constexpr const char* switchesStart = "0";

/// Returns a script for `buttons` buttons, each of which shows and hides a text field of its own:
/// a press shows or hides the field and re-tags the button, so that the next press does the
/// opposite. All orders of presses are possible, so there are 2^buttons places and
/// buttons·2^buttons presses.
toolkit::ValueRef<toolkit::Dictionary> switchesScript(std::size_t buttons);

/// Returns the window of that script.
tools::walkthrough::HostWindow switchesWindow(std::size_t buttons);

}  // namespace qz::bench
