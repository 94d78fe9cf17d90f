// SPDX-License-Identifier: MIT
// Values between the engine and Foundation.
//
// | value                | object                                                      |
// |----------------------|-------------------------------------------------------------|
// | absent               | nil                                                         |
// | string, date, data   | NSString, NSDate, NSData                                    |
// | number               | NSNumber; a boolean is the one of `numberWithBool:`         |
// | null                 | NSNull                                                      |
// | set                  | NSSet                                                       |
// | UID                  | NSDictionary with the number under "CF$UID", as in XML files |
// | array, dictionary    | a view: NSMutableArray, NSMutableDictionary                 |
//
// A view has no contents of its own: both sides see each other's changes. An array or dictionary
// has one view, as long as anybody holds it, and the value of a view is the array or dictionary
// itself. A view of an immutable value raises an exception when it is changed.
#pragma once

#import <Foundation/Foundation.h>

#include "qz/property_list/value.hpp"

namespace qz::toolkit::foundation {

/// Returns the object for `value`, autoreleased.
id objectOf(const ValueRef<>& value);

/// Returns the value for `object`. A collection that is not a view is copied, deeply; the copy of a
/// mutable one is mutable. Raises an invalid-argument exception for an object of another class, and
/// for collections that are nested more deeply than files may be.
ValueRef<> valueOf(id object);

}  // namespace qz::toolkit::foundation
