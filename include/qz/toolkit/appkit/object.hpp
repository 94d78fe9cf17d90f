// SPDX-License-Identifier: MIT
// Objective-C classes that the headers of the AppKit toolkit name, also for C++ code.
#pragma once

#ifdef __OBJC__
@class NSView;
@class NSWindow;
#else
class NSView;
class NSWindow;
#endif
