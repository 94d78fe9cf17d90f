// SPDX-License-Identifier: MIT
// Everything about an action that a walk-through can change, as a table.
#pragma once

#include <span>

#include "toolkit/qt/facets.hpp"

namespace qz::toolkit::qt {

/// Returns all facets of actions. Their objects are actions.
std::span<const Facet> actionFacets();

}  // namespace qz::toolkit::qt
