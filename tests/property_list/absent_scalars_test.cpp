// SPDX-License-Identifier: MIT
// Absent scalars answer as nothing does.
#include <gtest/gtest.h>

#include "qz/property_list/canonical_dump.hpp"
#include "qz/property_list/scalars.hpp"

namespace qz::toolkit {
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
}  // namespace qz::toolkit
