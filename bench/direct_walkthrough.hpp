// SPDX-License-Identifier: MIT
// The toolkit calls that commands come to, made directly: what running costs at least.
#pragma once

#include <vector>

#include "bench/operations.hpp"
#include "toolkit/window.hpp"

namespace bench {

/// Looks each control up by its tag and changes it, call for call as the engine does.
void runDirectly(const toolkit::Ref<toolkit::Window>& window,
                 const std::vector<Operation>& operations);

}  // namespace bench
