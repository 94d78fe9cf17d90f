// SPDX-License-Identifier: MIT
// Checks the classes of arguments, because Objective-C callers may pass anything.

#import "hosts/appkit/arguments.hpp"

#include "qz/toolkit/exception.hpp"
#import "toolkit/foundation/strings.hpp"
#import "toolkit/foundation/values.hpp"

namespace qz::hosts::appkit {

using toolkit::foundation::utf8;
using toolkit::foundation::valueOf;

namespace {

template <class T>
toolkit::ValueRef<T> checkedValue(id object, Class wanted) {
  if (!object) return {};
  requireKind(object, wanted);
  return as<T>(valueOf(object));
}

}  // namespace

void requireKind(id object, Class wanted) {
  if ([object isKindOfClass:wanted]) return;
  throw toolkit::InvalidArgumentException("expected an object of the class " +
                                          utf8(NSStringFromClass(wanted)) + ", got one of " +
                                          utf8(NSStringFromClass([object class])));
}

std::optional<std::string> textOf(NSString* object) {
  if (!object) return std::nullopt;
  requireKind(object, [NSString class]);
  return utf8(object);
}

toolkit::ValueRef<toolkit::Number> numberOf(NSNumber* object) {
  return checkedValue<toolkit::Number>(object, [NSNumber class]);
}

toolkit::ValueRef<toolkit::Array> arrayOf(NSArray* object) {
  return checkedValue<toolkit::Array>(object, [NSArray class]);
}

toolkit::ValueRef<toolkit::Dictionary> dictionaryOf(NSDictionary* object) {
  return checkedValue<toolkit::Dictionary>(object, [NSDictionary class]);
}

}  // namespace qz::hosts::appkit
