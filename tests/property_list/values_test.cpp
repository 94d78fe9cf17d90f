// SPDX-License-Identifier: MIT
// How values answer messages: those of their kind, those of other kinds, and when absent.
#include <gtest/gtest.h>

#include <cstdint>
#include <functional>
#include <string>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/scalars.hpp"
#include "qz/toolkit/exception.hpp"

namespace qz::toolkit {
namespace {

/// Returns the reason of the exception that `action` raises, or "" when it raises none.
template <class Raised>
std::string reasonOf(const std::function<void()>& action) {
  try {
    action();
  } catch (const Raised& exception) {
    return exception.reason();
  }
  return "";
}

std::string refusal(const std::function<void()>& action) {
  return reasonOf<InvalidArgumentException>(action);
}

TEST(Values, RaiseWhatTheyDoNotUnderstand) {
  const struct {
    ValueRef<> value;
    const char* className;
  } others[] = {
      {Date::make(0), "NSDate"},
      {Data::make("x"), "NSData"},
      {Null::make(), "NSNull"},
      {Uid::make(1), "NSKeyedArchiverUID"},
      {Set::make({}), "NSSet"},
      {Array::make(), "NSArray"},
      {Dictionary::make(), "NSDictionary"},
  };
  for (const auto& other : others) {
    const auto& value = other.value;
    const std::string start = std::string("-[") + other.className + " ";
    const std::string end = "]: unrecognized selector sent to instance";
    EXPECT_EQ(value->className(), other.className);
    EXPECT_EQ(refusal([&] { value->intValue(); }), start + "intValue" + end);
    EXPECT_EQ(refusal([&] { value->integerValue(); }), start + "integerValue" + end);
    EXPECT_EQ(refusal([&] { value->longValue(); }), start + "longValue" + end);
    EXPECT_EQ(refusal([&] { value->floatValue(); }), start + "floatValue" + end);
    EXPECT_EQ(refusal([&] { value->doubleValue(); }), start + "doubleValue" + end);
    EXPECT_EQ(refusal([&] { value->boolValue(); }), start + "boolValue" + end);
  }
}

TEST(Values, CountOnlyCollections) {
  const struct {
    ValueRef<> value;
    const char* className;
  } others[] = {
      {String::make("abc"), "NSString"},    {Number::withLong(3), "NSNumber"},
      {Number::withBool(true), "NSNumber"}, {Date::make(0), "NSDate"},
      {Data::make("abc"), "NSData"},        {Null::make(), "NSNull"},
      {Uid::make(3), "NSKeyedArchiverUID"},
  };
  const std::string end = "]: unrecognized selector sent to instance";
  for (const auto& other : others) {
    const auto& value = other.value;
    const std::string start = std::string("-[") + other.className + " ";
    EXPECT_EQ(value->className(), other.className);
    EXPECT_EQ(refusal([&] { value->count(); }), start + "count" + end);
    EXPECT_EQ(refusal([&] { value->objectAtIndex(0); }), start + "objectAtIndex:" + end);
  }
  const ValueRef<> dictionary = Dictionary::make();
  EXPECT_EQ(refusal([&] { dictionary->objectAtIndex(0); }), "-[NSDictionary objectAtIndex:" + end);
  const ValueRef<> set = Set::make({});
  EXPECT_EQ(refusal([&] { set->objectAtIndex(0); }), "-[NSSet objectAtIndex:" + end);
  EXPECT_EQ(dictionary->count(), 0U);
  EXPECT_EQ(Set::make({Null::make()})->count(), 1U);
}

TEST(Values, ArraysRaiseBeyondTheirEnd) {
  const auto array = Array::make({Number::withLong(1), Number::withLong(2), Number::withLong(3)});
  EXPECT_EQ(array->objectAtIndex(2)->intValue(), 3);
  EXPECT_EQ(reasonOf<RangeException>([&] { array->objectAtIndex(5); }),
            "-[NSArray objectAtIndex:]: index 5 beyond bounds [0 .. 2]");
  EXPECT_EQ(reasonOf<RangeException>([] { Array::make()->objectAtIndex(0); }),
            "-[NSArray objectAtIndex:]: index 0 beyond bounds for empty array");
}

TEST(Values, AbsentOnesAnswerNothing) {
  const ValueRef<> value;
  const ValueRef<String> string;
  const ValueRef<Number> number;
  const ValueRef<Array> array;
  const ValueRef<Dictionary> dictionary;
  for (const Value* absent : {&*value, static_cast<Value*>(&*string), static_cast<Value*>(&*number),
                              static_cast<Value*>(&*array), static_cast<Value*>(&*dictionary)}) {
    EXPECT_EQ(absent->kind(), Value::Kind::nothing);
    EXPECT_EQ(absent->className(), "");
    EXPECT_EQ(absent->intValue() + absent->integerValue() + absent->longValue(), 0);
    EXPECT_EQ(absent->doubleValue() + absent->floatValue(), 0);
    EXPECT_FALSE(absent->boolValue());
    EXPECT_EQ(absent->count(), 0U);
    EXPECT_FALSE(absent->objectAtIndex(7));
    EXPECT_EQ(absent->description(), "");
  }
  EXPECT_EQ(string->text(), "");
  EXPECT_EQ(number->bits(), 0U);
  EXPECT_FALSE(dictionary->objectForKey("k"));
  EXPECT_TRUE(dictionary->allKeys().empty());
  EXPECT_EQ(ValueRef<Data>()->bytes(), "");
  EXPECT_EQ(ValueRef<Date>()->secondsSinceReferenceDate(), 0);
  EXPECT_EQ(ValueRef<Uid>()->number(), 0U);
  EXPECT_TRUE(ValueRef<Set>()->elements().empty());
}

TEST(Values, AbsentCollectionsSwallowChanges) {
  const ValueRef<Array> array;
  const ValueRef<Dictionary> dictionary;
  array->addObject(String::make("x"));
  array->addObject(nullptr);
  array->setElements(Array::make({String::make("x")})->elements());
  array->borrowElements(Array::make({String::make("x")})->elements());
  array->removeAllObjects();
  dictionary->setObject(String::make("x"), "k");
  dictionary->setObject(nullptr, "k");
  dictionary->removeObjectForKey("k");
  dictionary->removeAllObjects();
  EXPECT_EQ(array->count(), 0U);
  EXPECT_EQ(dictionary->count(), 0U);
}

TEST(Values, ImmutableCollectionsRaiseOnChanges) {
  const auto array = Array::make({Null::make()}, Mutability::immutable);
  const auto dictionary =
      Dictionary::make({{String::make("k"), Null::make()}}, Mutability::immutable);
  const std::string end = "]: mutating message sent to an immutable object";
  EXPECT_EQ(refusal([&] { array->addObject(Null::make()); }), "-[NSArray addObject:" + end);
  EXPECT_EQ(refusal([&] { array->setElements({}); }), "-[NSArray setArray:" + end);
  EXPECT_EQ(refusal([&] { array->borrowElements({}); }), "-[NSArray setArray:" + end);
  EXPECT_EQ(refusal([&] { array->removeAllObjects(); }), "-[NSArray removeAllObjects" + end);
  EXPECT_EQ(refusal([&] { dictionary->setObject(Null::make(), "k"); }),
            "-[NSDictionary setObject:forKey:" + end);
  EXPECT_EQ(refusal([&] { dictionary->removeObjectForKey("k"); }),
            "-[NSDictionary removeObjectForKey:" + end);
  EXPECT_EQ(refusal([&] { dictionary->removeAllObjects(); }),
            "-[NSDictionary removeAllObjects" + end);
  EXPECT_EQ(array->count(), 1U);
  EXPECT_EQ(dictionary->count(), 1U);
}

TEST(Values, ChangeableCollectionsRaiseOnAbsentObjects) {
  EXPECT_EQ(refusal([] { Array::make()->addObject(nullptr); }),
            "-[NSArray addObject:]: the object is absent");
  EXPECT_EQ(refusal([] { Dictionary::make()->setObject(nullptr, "k"); }),
            "-[NSDictionary setObject:forKey:]: the object is absent");
}

TEST(Values, AreSharedAndKeepTheirIdentity) {
  const auto string = String::make("shared");
  const auto array = Array::make({string, string});
  EXPECT_TRUE(array->objectAtIndex(0) == ValueRef<>(string));
  EXPECT_TRUE(array->objectAtIndex(0) == array->objectAtIndex(1));
  EXPECT_FALSE(ValueRef<>(String::make("shared")) == ValueRef<>(string));
}

TEST(Values, NumbersAreWhatTheyWereMadeOf) {
  // Small numbers exist only once, and remain when nothing refers to them any more.
  for (int again = 0; again < 2; ++again) {
    for (std::int64_t i = -300; i <= 300; ++i) {
      const auto number = Number::withLong(i);
      ASSERT_EQ(number->longValue(), i);
      ASSERT_EQ(number->type(), Number::Type::signedInteger);
    }
  }
  EXPECT_TRUE(Number::withLong(0) == Number::withLong(0));
  EXPECT_TRUE(Number::withLong(255) == Number::withLong(255));
  EXPECT_FALSE(Number::withLong(256) == Number::withLong(256));
}

TEST(Values, AreAskedForByKind) {
  const ValueRef<> string = String::make("s");
  const ValueRef<> number = Number::withLong(1);
  EXPECT_EQ(asString(string)->text(), "s");
  EXPECT_FALSE(asString(number));
  EXPECT_FALSE(asString(nullptr));
  EXPECT_EQ(asNumber(number)->bits(), 1U);
  EXPECT_FALSE(asNumber(string));
  EXPECT_TRUE(asArray(ValueRef<>(Array::make())));
  EXPECT_FALSE(asArray(number));
  EXPECT_TRUE(asDictionary(ValueRef<>(Dictionary::make())));
  EXPECT_FALSE(asDictionary(ValueRef<>(Array::make())));
}

}  // namespace
}  // namespace qz::toolkit
