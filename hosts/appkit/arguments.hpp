// SPDX-License-Identifier: MIT
// Arguments of Objective-C callers as the engine takes them. Nil is absent; an object of a wrong
// class raises an invalid-argument exception.
#pragma once

#import <Foundation/Foundation.h>

#include <optional>
#include <string>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/scalars.hpp"

namespace qz::hosts::appkit {

/// Raises unless `object` is of the class or a subclass.
void requireKind(id object, Class wanted);

std::optional<std::string> textOf(NSString* object);
toolkit::ValueRef<toolkit::Number> numberOf(NSNumber* object);
toolkit::ValueRef<toolkit::Array> arrayOf(NSArray* object);
toolkit::ValueRef<toolkit::Dictionary> dictionaryOf(NSDictionary* object);

/// Returns `value` as a T; absent if it is.
template <class T>
toolkit::ValueRef<T> as(const toolkit::ValueRef<>& value) {
  if (!value) return {};
  return toolkit::Counted<T>::share(static_cast<T*>(value.pointer().get()));
}

}  // namespace qz::hosts::appkit
