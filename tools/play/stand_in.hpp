// SPDX-License-Identifier: MIT
// A window for a script that is played without one.
#pragma once

#include "toolkit/property_list/collections.hpp"
#include "tools/play/host_window.hpp"

namespace tools::play {

/// A window with one control for every tag that the script names: buttons where it has a list or
/// does what only buttons can, images and texts where commands put them. In the tags' order from
/// top to bottom.
HostWindow standInWindow(const toolkit::ValueRef<toolkit::Dictionary>& script);

}  // namespace tools::play
