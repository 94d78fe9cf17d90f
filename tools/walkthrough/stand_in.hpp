// SPDX-License-Identifier: MIT
// A window for a script that is played without one.
#pragma once

#include "qz/property_list/collections.hpp"
#include "tools/walkthrough/host_window.hpp"

namespace qz::tools::walkthrough {

/// Returns a window with one control for every tag that the script names, from top to bottom in the
/// order of the tags. The script's use of a tag decides its kind: image view, check box, button
/// (also if it has a list), else text field.
HostWindow standInWindow(const toolkit::ValueRef<toolkit::Dictionary>& script);

}  // namespace qz::tools::walkthrough
