// SPDX-License-Identifier: MIT
#import "hosts/appkit/platform.hpp"

#import "hosts/appkit/appkit_platform.hpp"

namespace qz::hosts::appkit {

namespace {

Platform* chosen = nullptr;  // tests' own; null for AppKit's

}  // namespace

Platform& platform() { return chosen ? *chosen : appKitPlatform(); }

void setPlatform(Platform* platform) { chosen = platform; }

}  // namespace qz::hosts::appkit
