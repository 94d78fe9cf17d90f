// SPDX-License-Identifier: MIT
// Timers of the engine as `NSTimer`s, and the other way round.
#pragma once

#import <Foundation/Foundation.h>

#include "qz/toolkit/run_loop.hpp"

namespace qz::hosts::appkit {

/// Returns the object of a timer, autoreleased: always the same while somebody holds it. Nil for an
/// absent timer.
NSTimer* objectOf(const toolkit::Ref<toolkit::Timer>& timer);

/// Returns the timer of an object: the engine's own, or one that stands for a host's `NSTimer` and
/// retains it. Absent for nil. Raises for an object of another class.
toolkit::Ref<toolkit::Timer> timerOf(id object);

}  // namespace qz::hosts::appkit
