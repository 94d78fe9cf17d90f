// SPDX-License-Identifier: MIT
// Calls back into the application from Qt's event handlers.
#pragma once

#include "qz/toolkit/calls.hpp"

namespace qz::toolkit::qt {

using toolkit::Calls;

}  // namespace qz::toolkit::qt
