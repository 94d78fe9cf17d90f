// SPDX-License-Identifier: MIT
// Twin: an object that Objective-C code gave to the engine, and the value that the engine has
// instead. Property by property, it lets the host get back the very object that it set.
#pragma once

#import <Foundation/Foundation.h>

#include "qz/property_list/value.hpp"

namespace qz::toolkit::foundation {

class Twin {
 public:
  Twin() = default;
  ~Twin() { [object_ release]; }
  Twin(const Twin&) = delete;
  Twin& operator=(const Twin&) = delete;

  /// Remembers `object`, which is retained, and returns its value. The same object again gives the
  /// same value, with the object's contents of now.
  ValueRef<> valueFor(id object);
  /// Returns the object for the engine's value, autoreleased: the remembered one if the value is
  /// its own, with the value's contents of now; otherwise as `objectOf`.
  id objectFor(const ValueRef<>& value);

  /// Copies changes that the host has made in its own mutable collection to the value.
  void pull();
  /// Copies changes that the engine has made in the value to the host's own mutable collection.
  void push();

 private:
  bool differs() const;

  id object_ = nil;  // retained
  ValueRef<> value_;
};

}  // namespace qz::toolkit::foundation
