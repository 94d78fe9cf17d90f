// SPDX-License-Identifier: MIT
// Text between the toolkit interface, which has generalised UTF-8, and Foundation, which has
// UTF-16.
// Text survives both ways, with NUL characters. GNUstep has no strings with unpaired surrogates:
// there they become U+FFFD.
#pragma once

#import <Foundation/Foundation.h>

#include <string>
#include <string_view>

namespace qz::toolkit::foundation {

/// Returns the text as a string of Foundation, autoreleased.
NSString* nsString(std::string_view text);

/// Returns the text of `string`; empty for nil.
std::string utf8(NSString* string);

}  // namespace qz::toolkit::foundation
