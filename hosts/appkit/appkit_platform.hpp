// SPDX-License-Identifier: MIT
// AppKit as the platform of Objective-C engines.
#pragma once

#include "hosts/appkit/platform.hpp"

namespace qz::hosts::appkit {

/// Returns the platform that all Objective-C engines share; made at the first call.
Platform& appKitPlatform();

}  // namespace qz::hosts::appkit
