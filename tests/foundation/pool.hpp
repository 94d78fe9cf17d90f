// SPDX-License-Identifier: MIT
// A test with a pool for what it autoreleases.
#pragma once

#import <Foundation/Foundation.h>
#include <gtest/gtest.h>

#include <functional>
#include <string>

#include "toolkit/foundation/raised.h"
#include "toolkit/foundation/strings.hpp"

namespace qz {

class WithPool : public testing::Test {
 protected:
  ~WithPool() override { [pool_ release]; }

  /// Releases what was autoreleased so far.
  void drain() {
    [pool_ release];
    pool_ = [[NSAutoreleasePool alloc] init];
  }

 private:
  NSAutoreleasePool* pool_ = [[NSAutoreleasePool alloc] init];
};

/// Returns the name and the reason of the exception of Foundation that `body` raises; "" if none.
inline std::string raisedBy(const std::function<void()>& body) {
  std::function<void()> copy = body;
  NSException* const raised =
      qzRaisedBy([](void* context) { (*static_cast<std::function<void()>*>(context))(); }, &copy);
  return raised ? toolkit::foundation::utf8([raised name]) + ": " +
                      toolkit::foundation::utf8([raised reason])
                : "";
}

}  // namespace qz
