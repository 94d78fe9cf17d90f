// SPDX-License-Identifier: MIT
// How this toolkit sends messages to AppKit.
#pragma once

#import "toolkit/foundation/exceptions.hpp"
#import "toolkit/foundation/kept.hpp"

namespace qz::toolkit::appkit {

/// Calls `body`, with a pool for what it autoreleases, because the caller may be C++ code without
/// one. What AppKit raises leaves this as an exception of the toolkit. The result must not be an
/// autoreleased object.
template <class Body>
auto calling(Body body) {
  const foundation::Pool pool;
  return foundation::sending(body);
}

}  // namespace qz::toolkit::appkit
