// SPDX-License-Identifier: MIT
// Catches exceptions of Foundation. In Objective-C, not Objective-C++: GCC compiles `@catch` in an
// Objective-C++ function as if it were C++, and the program crashes when something is raised.
#pragma once

#import <Foundation/Foundation.h>

#ifdef __cplusplus
extern "C" {
#endif

/// Calls `body` with `context`. Returns the exception that it raised, autoreleased; nil if it
/// returned. `body` must not let a C++ exception out.
NSException* qzRaisedBy(void (*body)(void* context), void* context);

#ifdef __cplusplus
}
#endif
