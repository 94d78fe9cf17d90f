// SPDX-License-Identifier: MIT
// Dictionaries: order, look-up, changes, copies; small ones, and those large enough for an index.
#include "qz/property_list/collections.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <limits>
#include <random>
#include <string>
#include <utility>
#include <vector>

#include "qz/property_list/key_index.hpp"
#include "qz/property_list/scalars.hpp"

namespace qz::toolkit {
namespace {

using Model = std::vector<std::pair<std::string, ValueRef<>>>;

auto placeIn(Model& model, const std::string& key) {
  return std::find_if(model.begin(), model.end(), [&](const auto& e) { return e.first == key; });
}

void expectSame(const Dictionary& dictionary, const Model& model) {
  ASSERT_EQ(dictionary.count(), model.size());
  for (std::size_t i = 0; i < model.size(); ++i) {
    const auto& [key, value] = model[i];
    ASSERT_EQ(asString(dictionary.entries()[i].key)->text(), key);
    ASSERT_TRUE(dictionary.entries()[i].value == value);
    ASSERT_TRUE(dictionary.objectForKey(key) == value);
  }
}

TEST(Dictionaries, BehaveLikeAListOfPairs) {
  std::mt19937 random(7);
  const auto dictionary = Dictionary::make();
  Model model;
  for (int step = 0; step < 4000; ++step) {
    const std::string key = std::to_string(random() % 60);
    const auto place = placeIn(model, key);
    if (random() % 5 < 3) {
      const ValueRef<> value = Number::withLong(step);
      dictionary->setObject(value, key);
      if (place == model.end()) {
        model.emplace_back(key, value);
      } else {
        place->second = value;
      }
    } else {
      dictionary->removeObjectForKey(key);
      if (place != model.end()) model.erase(place);
    }
    EXPECT_FALSE(dictionary->objectForKey("no such key"));
    if (step % 16 == 0) expectSame(*dictionary, model);
  }
  dictionary->removeAllObjects();
  expectSame(*dictionary, {});
  dictionary->setObject(Null::make(), "again");
  EXPECT_EQ(dictionary->allKeys(), std::vector<std::string>{"again"});
}

TEST(Dictionaries, OfManyKeysFindEachOfThem) {
  const auto dictionary = Dictionary::make();
  for (int i = 0; i < 20000; ++i) dictionary->setObject(Number::withLong(i), std::to_string(i));
  const auto copy = dictionary->copy(Mutability::immutable);
  for (int i = 0; i < 20000; ++i) {
    EXPECT_EQ(copy->objectForKey(std::to_string(i))->intValue(), i);
  }
  EXPECT_FALSE(copy->objectForKey("20000"));
}

TEST(Dictionaries, CopiesShareValuesAndNothingElse) {
  for (const int count : {3, 40}) {
    const auto original = Dictionary::make();
    for (int i = 0; i < count; ++i) original->setObject(Number::withLong(i), std::to_string(i));
    const auto copy = original->copy(Mutability::changeable);
    copy->removeObjectForKey("1");
    copy->setObject(Null::make(), "new");
    EXPECT_EQ(original->count(), static_cast<std::size_t>(count));
    EXPECT_EQ(original->objectForKey("1")->intValue(), 1);
    EXPECT_FALSE(original->objectForKey("new"));
    EXPECT_TRUE(copy->objectForKey("2") == original->objectForKey("2"));
  }
}

TEST(Dictionaries, OfAKeyThatComesTwiceTheLastValueCounts) {
  const auto one = Number::withLong(1);
  const auto two = Number::withLong(2);
  const auto dictionary = Dictionary::make(
      {{String::make("k"), one}, {String::make("l"), one}, {String::make("k"), two}});
  EXPECT_EQ(dictionary->allKeys(), (std::vector<std::string>{"k", "l"}));
  EXPECT_TRUE(dictionary->objectForKey("k") == ValueRef<>(two));
}

TEST(Dictionaries, KeepKeysOfOtherKindsApart) {
  const auto mixed = Dictionary::make({{Number::withLong(1), Null::make()},
                                       {String::make("1"), Number::withLong(7)},
                                       {Number::withBool(true), Null::make()}});
  EXPECT_EQ(mixed->count(), 3U);
  EXPECT_EQ(mixed->objectForKey("1")->intValue(), 7);
  EXPECT_EQ(mixed->allKeys(), std::vector<std::string>{"1"});
}

TEST(Keys, AreTheSameByWhatTheyCountTo) {
  const double notANumber = std::numeric_limits<double>::quiet_NaN();
  const ValueRef<> array = Array::make();
  const struct {
    ValueRef<> a;
    ValueRef<> b;
    bool same;
  } cases[] = {
      {Number::withLong(1), Number::withDouble(1), true},
      {Number::withFloat(1.5F), Number::withDouble(1.5), true},
      {Number::withLong(1), Number::withBool(true), false},
      {Number::withBool(true), Number::withBool(true), true},
      {Number::withLong(-1), Number::withUnsignedLong(UINT64_MAX), false},
      {Number::withLong(5), Number::withUnsignedLong(5), true},
      {Number::withUnsignedLong(UINT64_MAX), Number::withDouble(0x1p64), false},
      {Number::withLong((1LL << 53) + 1), Number::withDouble(0x1p53), false},
      {Number::withDouble(notANumber), Number::withDouble(notANumber), true},
      {Number::withDouble(0.0), Number::withDouble(-0.0), true},
      {Number::withLong(0), Number::withDouble(-0.0), true},
      {Date::make(0.0), Date::make(-0.0), true},
      {Date::make(1), Number::withLong(1), false},
      {Data::make("x"), Data::make("x"), true},
      {Data::make("x"), String::make("x"), false},
      {Uid::make(3), Uid::make(3), true},
      {Uid::make(3), Uid::make(4), false},
      {Null::make(), Null::make(), true},
      {array, array, true},
      {array, Array::make(), false},
  };
  for (const auto& [a, b, same] : cases) {
    EXPECT_EQ(sameKey(*a, *b), same) << a->description() << " and " << b->description();
    EXPECT_EQ(sameKey(*b, *a), same) << a->description() << " and " << b->description();
    EXPECT_TRUE(!same || hashOfKey(*a) == hashOfKey(*b)) << a->description();
  }
}

TEST(Arrays, GrowAndEmpty) {
  const auto array = Array::make();
  for (int i = 0; i < 100; ++i) array->addObject(Number::withLong(i));
  EXPECT_EQ(array->count(), 100U);
  EXPECT_EQ(array->objectAtIndex(99)->intValue(), 99);
  EXPECT_EQ(array->elements().front()->intValue(), 0);
  array->removeAllObjects();
  EXPECT_EQ(array->count(), 0U);
  array->addObject(Number::withLong(100));
  EXPECT_EQ(array->objectAtIndex(0)->intValue(), 100);
}

TEST(Arrays, TakeOverElements) {
  auto given = Array::make({String::make("7"), String::make("8")});
  const auto array = Array::make({String::make("1")});
  array->setElements(given->elements());
  given = nullptr;  // the array has its own references
  EXPECT_EQ(array->count(), 2U);
  EXPECT_EQ(array->objectAtIndex(1)->intValue(), 8);
}

TEST(Arrays, BorrowElementsUntilTheyHaveOthers) {
  const auto given = Array::make({String::make("7"), String::make("8")});
  const auto array = Array::make({String::make("1")});
  array->borrowElements(given->elements());
  EXPECT_EQ(array->elements().data(), given->elements().data());
  EXPECT_EQ(array->objectAtIndex(1)->intValue(), 8);
  array->addObject(String::make("9"));
  EXPECT_EQ(array->count(), 3U);
  EXPECT_EQ(array->objectAtIndex(0)->intValue(), 7);
  EXPECT_EQ(given->count(), 2U);
  array->borrowElements(given->elements());
  array->removeAllObjects();
  EXPECT_EQ(array->count(), 0U);
  EXPECT_EQ(given->count(), 2U);
}

}  // namespace
}  // namespace qz::toolkit
