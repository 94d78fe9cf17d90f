// SPDX-License-Identifier: MIT
// Conversions of values. The order of the tests in `converted` does not matter: no class is a kind
// of two of them.

#import "toolkit/foundation/values.hpp"

#include <cstdint>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/format_readers.hpp"
#include "qz/property_list/scalars.hpp"
#include "qz/toolkit/exception.hpp"
#import "toolkit/foundation/collection_views.hpp"
#import "toolkit/foundation/strings.hpp"

namespace qz::toolkit::foundation {

namespace {

template <class T>
T& as(const ValueRef<>& value) {
  return static_cast<T&>(*value);
}

NSNumber* nsNumber(const Number& number) {
  switch (number.type()) {
    case Number::Type::boolean:
      return [NSNumber numberWithBool:number.boolValue()];
    case Number::Type::unsignedInteger:
      return [NSNumber numberWithUnsignedLongLong:number.bits()];
    case Number::Type::real32:
      return [NSNumber numberWithFloat:number.floatValue()];
    case Number::Type::real64:
      return [NSNumber numberWithDouble:number.doubleValue()];
    case Number::Type::signedInteger:
      break;
  }
  return [NSNumber numberWithLongLong:number.integerValue()];
}

NSSet* nsSet(const Set& set) {
  NSMutableSet* const objects = [NSMutableSet setWithCapacity:set.count()];
  for (const ValueRef<>& element : set.elements()) [objects addObject:objectOf(element)];
  return objects;
}

NSData* nsData(const Data& data) {
  return [NSData dataWithBytes:data.bytes().data() length:data.bytes().size()];
}

NSDictionary* uidDictionary(const Uid& uid) {
  return [NSDictionary dictionaryWithObject:[NSNumber numberWithUnsignedInt:uid.number()]
                                     forKey:@"CF$UID"];
}

// Foundation has one object for each boolean; other numbers of a type with eight bits differ.
bool isBoolean(NSNumber* number) {
  return number == [NSNumber numberWithBool:YES] || number == [NSNumber numberWithBool:NO];
}

ValueRef<> numberOf(NSNumber* number) {
  if (isBoolean(number)) return Number::withBool([number boolValue]);
  switch (*[number objCType]) {
    case 'f':
      return Number::withFloat([number floatValue]);
    case 'd':
      return Number::withDouble([number doubleValue]);
    case 'Q':
    case 'L':
      return Number::withUnsignedLong([number unsignedLongLongValue]);
    default:
      return Number::withLong([number longLongValue]);
  }
}

ValueRef<> dataOf(NSData* data) {
  return Data::make({static_cast<const char*>([data bytes]), [data length]});
}

Mutability mutabilityOf(id object, Class mutableClass) {
  return [object isKindOfClass:mutableClass] ? Mutability::changeable : Mutability::immutable;
}

ValueRef<> converted(id object, std::size_t depth);

std::vector<ValueRef<>> convertedElements(NSEnumerator* objects, std::size_t depth) {
  std::vector<ValueRef<>> elements;
  while (id object = [objects nextObject]) elements.push_back(converted(object, depth));
  return elements;
}

ValueRef<> convertedDictionary(NSDictionary* dictionary, std::size_t depth) {
  std::vector<Dictionary::Entry> entries;
  NSEnumerator* const keys = [dictionary keyEnumerator];
  while (id key = [keys nextObject]) {
    entries.push_back({converted(key, depth), converted([dictionary objectForKey:key], depth)});
  }
  return Dictionary::make(std::move(entries),
                          mutabilityOf(dictionary, [NSMutableDictionary class]));
}

ValueRef<> convertedCollection(id object, std::size_t depth) {
  if (depth > deepestNesting) {
    throw InvalidArgumentException("collections are nested more than " +
                                   std::to_string(deepestNesting) + " deep");
  }
  if ([object isKindOfClass:[NSDictionary class]]) return convertedDictionary(object, depth + 1);
  auto elements = convertedElements([object objectEnumerator], depth + 1);
  if ([object isKindOfClass:[NSSet class]]) return Set::make(std::move(elements));
  return Array::make(std::move(elements), mutabilityOf(object, [NSMutableArray class]));
}

bool isCollection(id object) {
  return [object isKindOfClass:[NSArray class]] || [object isKindOfClass:[NSDictionary class]] ||
         [object isKindOfClass:[NSSet class]];
}

ValueRef<> converted(id object, std::size_t depth) {
  if (!object) return {};
  if ([object isKindOfClass:[NSString class]]) return String::make(utf8(object));
  if ([object isKindOfClass:[NSNumber class]]) return numberOf(object);
  if ([object isKindOfClass:[QZArrayView class]]) {
    return Counted<Value>::share([object arrayValue]);
  }
  if ([object isKindOfClass:[QZDictionaryView class]]) {
    return Counted<Value>::share([object dictionaryValue]);
  }
  if (isCollection(object)) return convertedCollection(object, depth);
  if ([object isKindOfClass:[NSDate class]]) {
    return Date::make([object timeIntervalSinceReferenceDate]);
  }
  if ([object isKindOfClass:[NSData class]]) return dataOf(object);
  if ([object isKindOfClass:[NSNull class]]) return Null::make();
  throw InvalidArgumentException(
      "a script holds strings, numbers, dates, data, nulls, arrays, sets and dictionaries, got an "
      "object of the class " +
      utf8(NSStringFromClass([object class])));
}

}  // namespace

id objectOf(const ValueRef<>& value) {
  switch (value->kind()) {
    case Value::Kind::nothing:
      return nil;
    case Value::Kind::string:
      return nsString(as<String>(value).text());
    case Value::Kind::number:
      return nsNumber(as<Number>(value));
    case Value::Kind::date:
      return [NSDate
          dateWithTimeIntervalSinceReferenceDate:as<Date>(value).secondsSinceReferenceDate()];
    case Value::Kind::data:
      return nsData(as<Data>(value));
    case Value::Kind::null:
      return [NSNull null];
    case Value::Kind::uid:
      return uidDictionary(as<Uid>(value));
    case Value::Kind::set:
      return nsSet(as<Set>(value));
    case Value::Kind::array:
      return viewOf(as<Array>(value));
    case Value::Kind::dictionary:
      return viewOf(as<Dictionary>(value));
  }
  return nil;
}

ValueRef<> valueOf(id object) { return converted(object, 0); }

}  // namespace qz::toolkit::foundation
