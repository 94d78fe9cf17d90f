// SPDX-License-Identifier: MIT
// Values of scripts as objects of Foundation, and back.

#import "toolkit/foundation/values.hpp"

#include <gtest/gtest.h>

#include <cstdint>
#include <string>
#include <string_view>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/scalars.hpp"
#include "qz/toolkit/exception.hpp"
#import "tests/foundation/pool.hpp"
#import "toolkit/foundation/strings.hpp"

namespace qz::toolkit::foundation {
namespace {

using namespace std::string_view_literals;
using FoundationValues = WithPool;

Number& asNumberOf(id object) {
  static ValueRef<> kept;
  kept = valueOf(object);
  return static_cast<Number&>(*kept);
}

NSMutableDictionary* viewOfDictionary(const ValueRef<Dictionary>& dictionary) {
  return objectOf(dictionary);
}

NSMutableArray* viewOfArray(const ValueRef<Array>& array) { return objectOf(array); }

TEST_F(FoundationValues, KeepEveryText) {
  for (const std::string_view text : {"", "plain", "zero\0inside", "Größe \xF0\x9F\x98\x80"}) {
    EXPECT_EQ(utf8(nsString(text)), text);
  }
  EXPECT_EQ([nsString("\xF0\x9F\x98\x80") length], 2U);
  EXPECT_EQ(utf8(nsString("a\0b"sv)), "a\0b"sv);
  EXPECT_EQ(utf8(nil), "");
}

TEST_F(FoundationValues, KeepOrReplaceAnUnpairedSurrogate) {
  const std::string text = utf8(nsString("\xED\xA0\x80 alone"));
  EXPECT_TRUE(text == "\xED\xA0\x80 alone" || text == "\xEF\xBF\xBD alone") << text;
}

TEST_F(FoundationValues, AreNilIfAbsent) {
  EXPECT_EQ(objectOf({}), nil);
  EXPECT_FALSE(valueOf(nil));
}

TEST_F(FoundationValues, KeepTheTypeOfANumber) {
  const std::int64_t least = INT64_MIN;
  const std::uint64_t most = UINT64_MAX;
  EXPECT_EQ(asNumberOf(objectOf(Number::withBool(true))).type(), Number::Type::boolean);
  EXPECT_EQ(asNumberOf(objectOf(Number::withLong(1))).type(), Number::Type::signedInteger);
  EXPECT_EQ(asNumberOf(objectOf(Number::withLong(least))).integerValue(), least);
  EXPECT_EQ(asNumberOf(objectOf(Number::withUnsignedLong(most))).type(),
            Number::Type::unsignedInteger);
  EXPECT_EQ(asNumberOf(objectOf(Number::withUnsignedLong(most))).bits(), most);
  EXPECT_EQ(asNumberOf(objectOf(Number::withFloat(0.1F))).type(), Number::Type::real32);
  EXPECT_EQ(asNumberOf(objectOf(Number::withFloat(0.1F))).floatValue(), 0.1F);
  EXPECT_EQ(asNumberOf(objectOf(Number::withDouble(0.1))).type(), Number::Type::real64);
  EXPECT_EQ(asNumberOf(objectOf(Number::withDouble(0.1))).doubleValue(), 0.1);
}

TEST_F(FoundationValues, ReadNumbersOfEveryCType) {
  EXPECT_EQ(asNumberOf([NSNumber numberWithChar:-5]).integerValue(), -5);
  EXPECT_EQ(asNumberOf([NSNumber numberWithChar:1]).type(), Number::Type::signedInteger);
  EXPECT_EQ(asNumberOf([NSNumber numberWithUnsignedShort:65535]).integerValue(), 65535);
  EXPECT_EQ(asNumberOf([NSNumber numberWithInteger:-7]).integerValue(), -7);
  EXPECT_EQ(asNumberOf([NSDecimalNumber decimalNumberWithString:@"2.5"]).doubleValue(), 2.5);
}

TEST_F(FoundationValues, KeepDatesDataAndNull) {
  const ValueRef<> date = valueOf(objectOf(Date::make(12.5)));
  EXPECT_EQ(static_cast<const Date&>(*date).secondsSinceReferenceDate(), 12.5);
  const ValueRef<> data = valueOf(objectOf(Data::make("a\0b"sv)));
  EXPECT_EQ(static_cast<const Data&>(*data).bytes(), "a\0b"sv);
  EXPECT_EQ(objectOf(Null::make()), [NSNull null]);
  EXPECT_EQ(valueOf([NSNull null])->kind(), Value::Kind::null);
}

TEST_F(FoundationValues, ShowSetsAndUids) {
  NSSet* const set = objectOf(Set::make({String::make("a"), String::make("b")}));
  EXPECT_TRUE([set containsObject:@"a"]);
  EXPECT_EQ(valueOf(set)->kind(), Value::Kind::set);
  EXPECT_EQ(valueOf(set)->count(), 2U);
  NSDictionary* const uid = objectOf(Uid::make(9));
  EXPECT_EQ([[uid objectForKey:@"CF$UID"] intValue], 9);
}

TEST_F(FoundationValues, ShowADictionaryOfTheEngineWithoutACopy) {
  const auto dictionary = Dictionary::make();
  NSMutableDictionary* const view = viewOfDictionary(dictionary);
  [view setObject:@"one" forKey:@"1"];
  EXPECT_EQ(dictionary->objectForKey("1")->description(), "one");
  dictionary->setObject(Number::withLong(2), "2");
  EXPECT_EQ([[view objectForKey:@"2"] intValue], 2);
  EXPECT_EQ([view count], 2U);
  [view removeObjectForKey:@"1"];
  EXPECT_EQ(dictionary->allKeys(), std::vector<std::string>{"2"});
  EXPECT_TRUE([view isEqual:[NSDictionary dictionaryWithObject:[NSNumber numberWithInt:2]
                                                        forKey:@"2"]]);
  EXPECT_EQ([[view allKeys] count], 1U);
  [view removeAllObjects];
  EXPECT_EQ(dictionary->count(), 0U);
}

TEST_F(FoundationValues, ShowADictionaryOfTheEngineInEveryWay) {
  const auto dictionary = Dictionary::make();
  dictionary->setObject(String::make("one"), "1");
  dictionary->setObject(String::make("two"), "2");
  NSMutableDictionary* const view = viewOfDictionary(dictionary);
  NSDictionary* const same =
      [NSDictionary dictionaryWithObjectsAndKeys:@"one", @"1", @"two", @"2", nil];
  EXPECT_EQ([[view allValues] count], 2U);
  EXPECT_TRUE([[view allValues] containsObject:@"two"]);
  EXPECT_TRUE([[view allKeysForObject:@"two"] isEqual:[NSArray arrayWithObject:@"2"]]);
  EXPECT_TRUE([view isEqual:same]);
  EXPECT_TRUE([same isEqual:view]);
  EXPECT_TRUE([[[view mutableCopy] autorelease] isEqual:same]);
  EXPECT_TRUE([[[view copy] autorelease] isEqual:same]);
  EXPECT_TRUE([[view description] isEqual:[same description]]);
  [view removeAllObjects];
  EXPECT_EQ(dictionary->count(), 0U);
  [view addEntriesFromDictionary:same];
  EXPECT_EQ(dictionary->count(), 2U);
}

TEST_F(FoundationValues, ShowAnArrayOfTheEngineWithoutACopy) {
  const auto array = Array::make();
  NSMutableArray* const view = viewOfArray(array);
  [view addObject:@"b"];
  [view insertObject:@"a" atIndex:0];
  [view addObject:@"c"];
  [view replaceObjectAtIndex:1 withObject:@"B"];
  EXPECT_EQ(array->description(), "( a, B, c )");
  [view removeLastObject];
  [view removeObjectAtIndex:0];
  EXPECT_EQ(array->description(), "( B )");
  array->addObject(String::make("d"));
  EXPECT_TRUE([[view lastObject] isEqual:@"d"]);
  EXPECT_TRUE([[view componentsJoinedByString:@""] isEqual:@"Bd"]);
}

TEST_F(FoundationValues, AreTheSameObjectEachTime) {
  const auto inner = Array::make({String::make("a")});
  const auto outer = Dictionary::make();
  outer->setObject(inner, "1");
  NSMutableDictionary* const view = viewOfDictionary(outer);
  EXPECT_EQ(viewOfDictionary(outer), view);
  EXPECT_EQ([view objectForKey:@"1"], objectOf(inner));
  EXPECT_EQ(valueOf(view), ValueRef<>(outer));
  EXPECT_EQ(valueOf([view objectForKey:@"1"]), ValueRef<>(inner));
}

TEST_F(FoundationValues, StayTheValueOfAViewAfterTheEngineHasDroppedThem) {
  auto array = Array::make({String::make("a")});
  NSMutableArray* const view = [viewOfArray(array) retain];
  array = {};
  drain();
  EXPECT_TRUE([[view objectAtIndex:0] isEqual:@"a"]);
  [view release];
}

TEST_F(FoundationValues, GetAFreshViewOnceNobodyHoldsTheOld) {
  const auto array = Array::make({String::make("a")});
  viewOfArray(array);
  drain();
  EXPECT_EQ([viewOfArray(array) count], 1U);
}

TEST_F(FoundationValues, RaiseWhatFoundationRaises) {
  struct Case {
    const char* raised;
    std::function<void()> body;
  };
  NSMutableArray* const array = viewOfArray(Array::make());
  NSMutableArray* const fixed = viewOfArray(Array::make({}, Mutability::immutable));
  NSMutableDictionary* const dictionary = viewOfDictionary(Dictionary::make());
  id none = nil;
  const Case cases[] = {
      {"NSRangeException", [&] { [array objectAtIndex:0]; }},
      {"NSRangeException", [&] { [array removeLastObject]; }},
      {"NSRangeException", [&] { [array insertObject:@"a" atIndex:1]; }},
      {"NSInvalidArgumentException", [&] { [array addObject:none]; }},
      {"NSInvalidArgumentException", [&] { [fixed addObject:@"a"]; }},
      {"NSInvalidArgumentException", [&] { [dictionary setObject:none forKey:@"1"]; }},
      {"NSInvalidArgumentException",
       [&] { [dictionary setObject:@"a" forKey:static_cast<id>([NSNull null])]; }},
  };
  for (const Case& each : cases) {
    const std::string raised = raisedBy(each.body);
    EXPECT_EQ(raised.substr(0, raised.find(':')), each.raised) << raised;
  }
}

TEST_F(FoundationValues, CopyTheCollectionsOfTheHost) {
  NSMutableArray* const list = [NSMutableArray arrayWithObject:@"HIDE_OBJECT_WITH_ID"];
  NSDictionary* const script = [NSDictionary dictionaryWithObject:list forKey:@"1"];
  const ValueRef<> value = valueOf(script);
  [list addObject:@"later"];
  EXPECT_EQ(value->description(), "{ 1 = ( HIDE_OBJECT_WITH_ID ); }");
  EXPECT_THROW(static_cast<Dictionary&>(*value).setObject(Null::make(), "2"), Exception);
  EXPECT_NO_THROW(static_cast<Array&>(*valueOf(list)).addObject(Null::make()));
}

TEST_F(FoundationValues, FindKeysThatAreNotStrings) {
  NSDictionary* const numbers = [NSDictionary dictionaryWithObject:@"seven"
                                                            forKey:[NSNumber numberWithInt:7]];
  NSDictionary* const view = objectOf(valueOf(numbers));
  EXPECT_TRUE([[view objectForKey:[NSNumber numberWithInt:7]] isEqual:@"seven"]);
  EXPECT_EQ([view objectForKey:@"7"], nil);
}

TEST_F(FoundationValues, RefuseWhatNoScriptHolds) {
  EXPECT_THROW(valueOf([NSObject class]), InvalidArgumentException);
  NSMutableArray* const endless = [NSMutableArray array];
  const id itself = endless;
  [endless addObject:itself];
  EXPECT_THROW(valueOf(endless), InvalidArgumentException);
  [endless removeAllObjects];
}

}  // namespace
}  // namespace qz::toolkit::foundation
