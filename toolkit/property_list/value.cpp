// SPDX-License-Identifier: MIT
#include "qz/property_list/value.hpp"

#include "qz/toolkit/exception.hpp"

namespace qz::toolkit {

Value& Value::nothing() { return nothingAs<Value>(); }

std::string_view Value::className() const {
  switch (kind_) {
    case Kind::nothing:
      return "";
    case Kind::string:
      return "NSString";
    case Kind::number:
      return "NSNumber";
    case Kind::date:
      return "NSDate";
    case Kind::data:
      return "NSData";
    case Kind::null:
      return "NSNull";
    case Kind::uid:
      return "NSKeyedArchiverUID";
    case Kind::set:
      return "NSSet";
    case Kind::array:
      return "NSArray";
    case Kind::dictionary:
      return "NSDictionary";
  }
  return "";
}

std::int32_t Value::intValue() const {
  requireUnderstanding("intValue");
  return 0;
}

std::int64_t Value::integerValue() const {
  requireUnderstanding("integerValue");
  return 0;
}

std::int64_t Value::longValue() const {
  requireUnderstanding("longValue");
  return 0;
}

float Value::floatValue() const {
  requireUnderstanding("floatValue");
  return 0;
}

double Value::doubleValue() const {
  requireUnderstanding("doubleValue");
  return 0;
}

bool Value::boolValue() const {
  requireUnderstanding("boolValue");
  return false;
}

std::size_t Value::count() const {
  requireUnderstanding("count");
  return 0;
}

const ValueRef<>& Value::objectAtIndex(std::size_t) const {
  requireUnderstanding("objectAtIndex:");
  static const ValueRef<> absent;
  return absent;
}

void Value::destroy() noexcept { delete this; }

void Value::requireUnderstanding(std::string_view selector) const {
  if (kind_ != Kind::nothing) raiseUnrecognizedSelector(className(), selector);
}

}  // namespace qz::toolkit
