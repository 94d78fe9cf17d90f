// SPDX-License-Identifier: MIT
// Documents as the memory resources of standard containers.
#include "qz/property_list/document.hpp"

#include <gtest/gtest.h>

#include <memory>
#include <memory_resource>
#include <utility>
#include <vector>

namespace qz::toolkit {
namespace {

struct Release {
  void operator()(Document* document) const { document->release(); }
};
using OwnDocument = std::unique_ptr<Document, Release>;

TEST(Documents, AreEqualOnlyToThemselves) {
  const OwnDocument one(Document::make());
  const OwnDocument two(Document::make());
  const std::pmr::memory_resource& first = *one;
  const std::pmr::memory_resource& second = *two;
  EXPECT_FALSE(first == second);
  EXPECT_FALSE(first == *std::pmr::new_delete_resource());
  EXPECT_TRUE(first == first);
}

TEST(Documents, KeepContainersApart) {
  const OwnDocument one(Document::make());
  const OwnDocument two(Document::make());
  std::pmr::vector<int> here({1, 2, 3}, one.get());
  std::pmr::vector<int> there({4}, two.get());
  const int* const elements = here.data();
  there = std::move(here);  // copies, because the memory of another document cannot be taken over
  EXPECT_EQ(there, (std::pmr::vector<int>{1, 2, 3}));
  EXPECT_NE(there.data(), elements);
}

}  // namespace
}  // namespace qz::toolkit
