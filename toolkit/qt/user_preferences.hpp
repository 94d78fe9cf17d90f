// SPDX-License-Identifier: MIT
// What users want of every program. Qt 6.4 does not report these settings of the desktop, so the
// host or the user sets a dynamic property of the application or an environment variable to
// anything but 0 or false.
#pragma once

namespace qz::toolkit::qt {

inline constexpr const char* reducedMotionProperty = "qzReducedMotion";
inline constexpr const char* reducedMotionVariable = "QZ_REDUCED_MOTION";
inline constexpr const char* highContrastProperty = "qzHighContrast";
inline constexpr const char* highContrastVariable = "QZ_HIGH_CONTRAST";

/// True if nothing is to move or blink by itself.
bool prefersReducedMotion();
/// True if lines are to be thick and nothing is to be dimmed.
bool prefersHighContrast();

}  // namespace qz::toolkit::qt
