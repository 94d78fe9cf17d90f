// SPDX-License-Identifier: MIT
// Objects that a host has set, which it gets back.

#import "toolkit/foundation/twin.hpp"

#include <gtest/gtest.h>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/scalars.hpp"
#import "tests/foundation/pool.hpp"

namespace qz::toolkit::foundation {
namespace {

using Twins = WithPool;

TEST_F(Twins, GiveBackTheObjectThatWasSet) {
  Twin twin;
  NSNumber* const number = [NSNumber numberWithInt:4711];
  const ValueRef<> value = twin.valueFor(number);
  EXPECT_EQ(twin.objectFor(value), number);
  EXPECT_EQ(twin.valueFor(number), value);
}

TEST_F(Twins, GiveTheEnginesOwnValueOtherwise) {
  Twin twin;
  twin.valueFor(@"set");
  EXPECT_TRUE([twin.objectFor(String::make("other")) isEqual:@"other"]);
  EXPECT_EQ(twin.objectFor({}), nil);
  EXPECT_FALSE(twin.valueFor(nil));
  EXPECT_EQ(twin.objectFor({}), nil);
}

TEST_F(Twins, SeeChangesOnBothSides) {
  Twin twin;
  NSMutableDictionary* const table = [NSMutableDictionary dictionaryWithObject:@"a" forKey:@"1"];
  const ValueRef<> value = twin.valueFor(table);
  auto& dictionary = static_cast<Dictionary&>(*value);
  [table setObject:@"b" forKey:@"2"];
  twin.pull();
  EXPECT_EQ(dictionary.objectForKey("2")->description(), "b");
  dictionary.removeObjectForKey("1");
  EXPECT_EQ(twin.objectFor(value), table);
  EXPECT_EQ([table objectForKey:@"1"], nil);

  NSMutableArray* const list = [NSMutableArray arrayWithObject:@"a"];
  const ValueRef<> elements = twin.valueFor(list);
  [list addObject:@"b"];
  twin.pull();
  EXPECT_EQ(elements->description(), "( a, b )");
  static_cast<Array&>(*elements).removeAllObjects();
  twin.push();
  EXPECT_EQ([list count], 0U);
}

TEST_F(Twins, LetTheOldObjectGo) {
  NSMutableArray* const list = [[NSMutableArray alloc] init];
  Twin twin;
  twin.valueFor(list);
  drain();
  EXPECT_EQ([list retainCount], 2U);
  twin.valueFor(@"another");
  drain();
  EXPECT_EQ([list retainCount], 1U);
  [list release];
}

}  // namespace
}  // namespace qz::toolkit::foundation
