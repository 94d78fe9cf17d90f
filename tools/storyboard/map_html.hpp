// SPDX-License-Identifier: MIT
// The map of a page as HTML.
#pragma once

#include <string>

#include "tools/storyboard/map.hpp"

namespace qz::tools::storyboard {

/// Returns the spans that show the patches of a step, over the page's ground.
std::string patchesOf(const PageStep& step);

/// Returns the map as an element that the user can open.
std::string htmlOf(const Page& page, const PageMap& map);

}  // namespace qz::tools::storyboard
