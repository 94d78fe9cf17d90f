// SPDX-License-Identifier: MIT
// Absent scalars answer as nothing does.
#include <gtest/gtest.h>

#include "toolkit/property_list/canonical_dump.hpp"
#include "toolkit/property_list/scalars.hpp"

namespace toolkit {
namespace {

TEST(AbsentScalars, AreOfNoKindAndDescribeNothing) {
  const ValueRef<Null> null;
  EXPECT_EQ(null->kind(), Value::Kind::nothing);
  EXPECT_EQ(null->className(), "");
  EXPECT_EQ(null->description(), "");
  EXPECT_EQ(null->intValue(), 0);
  EXPECT_EQ(null->count(), 0U);
  EXPECT_EQ(canonicalDump(*null.operator->()), "");
  EXPECT_EQ(ValueRef<String>()->description(), null->description());
}

}  // namespace
}  // namespace toolkit
