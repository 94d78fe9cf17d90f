// SPDX-License-Identifier: MIT
// Makes the toolkit calls of commands directly: the least that running them can cost.
#pragma once

#include <vector>

#include "bench/operations.hpp"
#include "toolkit/window.hpp"

namespace bench {

/// Looks up each control by its tag and changes it, with the same calls as the engine.
void runDirectly(const toolkit::Ref<toolkit::Window>& window,
                 const std::vector<Operation>& operations);

}  // namespace bench
