// SPDX-License-Identifier: MIT
// What C++ code holds of Objective-C: retained objects, and pools.
#pragma once

#import <Foundation/Foundation.h>

#include <utility>

namespace qz::toolkit::foundation {

/// Keeps an object retained. `Pointer` is the type of the pointer, such as `NSView*`.
template <class Pointer>
class Kept {
 public:
  Kept() = default;
  explicit Kept(Pointer object) : object_([object retain]) {}
  Kept(const Kept& other) : Kept(other.object_) {}
  Kept(Kept&& other) noexcept : object_(std::exchange(other.object_, nil)) {}
  Kept& operator=(Kept other) noexcept {
    std::swap(object_, other.object_);
    return *this;
  }
  ~Kept() { [object_ release]; }

  /// Takes over a count that the caller owns.
  static Kept adopt(Pointer object) {
    Kept kept;
    kept.object_ = object;
    return kept;
  }

  Pointer get() const { return object_; }
  explicit operator bool() const { return object_ != nil; }

 private:
  Pointer object_ = nil;
};

/// Releases, at its end, what was autoreleased during its life.
class Pool {
 public:
  Pool() = default;
  ~Pool() { [pool_ release]; }
  Pool(const Pool&) = delete;
  Pool& operator=(const Pool&) = delete;

 private:
  NSAutoreleasePool* const pool_ = [[NSAutoreleasePool alloc] init];
};

}  // namespace qz::toolkit::foundation
