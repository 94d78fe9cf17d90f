// SPDX-License-Identifier: MIT
// The names of the commands, which Objective-C hosts assign.
#pragma once

namespace qz::hosts::appkit {

/// Renames the commands to whose constants a host has assigned other strings.
void readCommandNames();

}  // namespace qz::hosts::appkit
