// SPDX-License-Identifier: MIT
// What assistive technology finds in a guide's panel.
#pragma once

namespace qz::hosts::qt {

/// Makes the panels of all guides present their text to assistive technology as a part of the
/// panel, without the area that scrolls it: the area and its viewport have nothing to say. Call it
/// before a panel is made.
void simplifyAccessiblePanels();

}  // namespace qz::hosts::qt
