// SPDX-License-Identifier: MIT
#import "hosts/appkit/appkit_platform.hpp"
#include <cstdlib>
namespace qz::hosts::appkit {
Platform& appKitPlatform() { std::abort(); }
}
