// SPDX-License-Identifier: MIT
// Makes the toolkit calls of commands directly: the least that running them can cost.
#pragma once

#include <vector>

#include "bench/operations.hpp"
#include "qz/toolkit/window.hpp"

namespace qz::bench {

/// Looks up each control by its tag and changes it, with the same calls as the engine.
void runDirectly(const toolkit::Ref<toolkit::Window>& window,
                 const std::vector<Operation>& operations);

}  // namespace qz::bench
