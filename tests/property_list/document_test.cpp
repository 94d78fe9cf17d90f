// SPDX-License-Identifier: MIT
// Documents as the memory resources of standard containers.
#include "qz/property_list/document.hpp"

#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <memory_resource>
#include <utility>
#include <vector>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/scalars.hpp"

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

TEST(Documents, HoldValuesSideBySide) {
  // The sizes are those of the objects; a text and bytes follow theirs, rounded up to whole units.
  const struct {
    const char* kind;
    std::function<void*(Document&)> make;
    std::size_t size;
  } cases[] = {
      {"string", [](Document& in) { return String::make(in, "12345678"); }, sizeof(String) + 8},
      {"longer string", [](Document& in) { return String::make(in, "123456789"); },
       sizeof(String) + 16},
      {"number", [](Document& in) { return Number::make(in, Number::Type::real64, 0); },
       sizeof(Number)},
      {"date", [](Document& in) { return Date::make(in, 0); }, sizeof(Date)},
      {"data", [](Document& in) { return Data::make(in, "1"); }, sizeof(Data) + 8},
      {"null", [](Document& in) { return Null::make(in); }, sizeof(Null)},
      {"uid", [](Document& in) { return Uid::make(in, 1); }, sizeof(Uid)},
      {"array", [](Document& in) { return Array::make(in, {}); }, sizeof(Array)},
      {"set", [](Document& in) { return Set::make(in, {}); }, sizeof(Set)},
      {"dictionary",
       [](Document& in) { return Dictionary::make(in, {}, {}, Dictionary::Duplicates::firstWins); },
       sizeof(Dictionary)},
  };
  for (const auto& [kind, make, size] : cases) {
    const OwnDocument document(Document::make());
    const auto* const first = static_cast<std::byte*>(make(*document));
    const auto* const next = static_cast<std::byte*>(make(*document));
    const std::size_t units = (size + Document::unit - 1) / Document::unit;
    EXPECT_EQ(next - first, static_cast<std::ptrdiff_t>(units * Document::unit)) << kind;
  }
}

}  // namespace
}  // namespace qz::toolkit
