// SPDX-License-Identifier: MIT
// Chooses few and short walks that reach all goals.
#pragma once

#include <vector>

#include "tools/cover/visit_graph.hpp"

namespace qz::tools::cover {

/// Returns walks from a start that reach all goals between them, the first ones first. No walk goes
/// on past `longest` moves, unless its last goal is farther away.
std::vector<check::Path> toursOf(const check::Exploration& exploration, const VisitGraph& graph,
                                 std::size_t longest);

}  // namespace qz::tools::cover
