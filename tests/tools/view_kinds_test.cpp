// SPDX-License-Identifier: MIT
// The table of the kinds of view.
#include "qz/drivers/view_kinds.hpp"

#include <gtest/gtest.h>

#include <iterator>
#include <set>
#include <string_view>

#include "tests/enumerators.hpp"

namespace qz::drivers {
namespace {

TEST(ViewKinds, EveryKindHasARow) {
  const auto kinds = enumerators<ViewKind>();
  ASSERT_EQ(std::size(viewKinds), kinds.size());
  for (const ViewKind kind : kinds) EXPECT_EQ(rowOf(kind).kind, kind);
}

TEST(ViewKinds, EveryRowIsFoundByItsName) {
  std::set<std::string_view> words;
  for (const ViewKindRow& row : viewKinds) {
    EXPECT_EQ(viewKindNamed(row.name), row.kind) << row.name;
    EXPECT_EQ(row.name.substr(0, row.name.find(':')), row.className);
    EXPECT_TRUE(words.insert(row.word).second) << row.word;
  }
  EXPECT_EQ(viewKindNames().size(), std::size(viewKinds));
  EXPECT_EQ(viewKindNamed("NSUnknown"), std::nullopt);
}

TEST(ViewKinds, OnlyButtonsShowAState) {
  for (const ViewKindRow& row : viewKinds) {
    EXPECT_TRUE(row.isControl || !row.isButton) << row.name;
    EXPECT_TRUE(row.isButton || !row.showsState) << row.name;
    EXPECT_TRUE(row.showsState || !row.hasMixedState) << row.name;
  }
}

}  // namespace
}  // namespace qz::drivers
